// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/EVDO/FingerC2I.h"

#include "LogGenerator/C2K/PilotList.h"
#include "Platform/SystemLog.h"

namespace velmora::C2K {

namespace {

constexpr std::size_t minimumLength = 23; // the fingers follow
constexpr std::size_t countAt = 22;
constexpr std::size_t fingerLength = 14;
constexpr std::uint16_t unassigned = 0xFFFF;

/// Of the entries.
Value fingersOf(Bytes bytes, const void*) {
    PilotList fingers;
    const CountedList entries(Record(bytes), 0, fingerLength, bytes.size() / fingerLength);
    for (std::size_t i = 0; i < entries.count(); ++i) {
        const Record finger = entries[i];
        if (const std::uint16_t pnOffset = finger.u16(0); pnOffset != unassigned)
            fingers.add(i, pnOffset, decibelsOf512ths(finger.u16(6)));
    }
    return fingers.valueOrNone();
}

} // namespace

void FingerC2I::parse(const Record& record, Dictionary&, const Publisher& publisher) const {
    constexpr auto minimum = static_cast<unsigned long>(minimumLength);
    if (record.size() < minimumLength) {
        logFormat(LogPriority::Error, "Log code 0x108a is %u bytes long but must be at least %lu bytes.",
                  lengthOf(record), minimum);
        return;
    }
    const std::size_t count = record.u8(countAt);
    if (record.size() != minimumLength + fingerLength * count) {
        // The size shown is always that of the part before the fingers, on purpose.
        logFormat(LogPriority::Error,
                  "Log code 0x108a has bad length of %u bytes, but has %d substructs (size=%lu).",
                  lengthOf(record), static_cast<int>(count), minimum);
        return;
    }
    publisher.publishLater("kFingerC2I", fingersOf, nullptr,
                           record.part(minimumLength, fingerLength * count).bytes());
}

} // namespace velmora::C2K
