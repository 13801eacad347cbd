// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Properties/Conversions.h"

#include <gtest/gtest.h>

#include <rapidcheck/gtest.h>

// What a conversion can keep it keeps, to the byte, whatever the messages are.

namespace velmora {
namespace {

const std::string gsm = "Ostrel_GSM";

RC_GTEST_PROP(Recordings, HaveTheMessagesAndTimesThatWereWritten, ()) {
    const auto messages = *inTime(anyBytes());
    RC_ASSERT(messagesOf(recordingOf(messages, gsm)) == messages);
}

RC_GTEST_PROP(Recordings, AreTheSameByteForByteWhenNothingIsLeftOut, ()) {
    const Data recording = recordingOf(*inTime(anyBytes()), gsm);
    RC_ASSERT(converted(recording, FileForm::Recording, gsm) == recording);
}

RC_GTEST_PROP(DLFLogs, HaveTheMessagesOfTheRecording, ()) {
    const auto messages = *inTime(anyRecord());
    const Data log = converted(recordingOf(messages, gsm), FileForm::DLFLog, gsm);
    RC_ASSERT(bytesOf(messagesOf(log)) == bytesOf(messages));
}

RC_GTEST_PROP(DLFLogs, AreTheSameAfterARecordingWasMadeOfThem, ()) {
    const auto messages = *inTime(anyRecord());
    const Data log = converted(recordingOf(messages, gsm), FileForm::DLFLog, gsm);
    const Data recording = converted(log, FileForm::Recording, gsm);
    RC_ASSERT(bytesOf(messagesOf(recording)) == bytesOf(messages));
    RC_ASSERT(bytesOf(messagesOf(converted(recording, FileForm::DLFLog, gsm))) == bytesOf(messages));
}

} // namespace
} // namespace velmora
