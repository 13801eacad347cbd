// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/BLER.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

constexpr Field windowFields[] = {
    {"Window Size", u16At(14), integer("%d")},
};
constexpr Layout window = layout(16, windowFields); // 0x4116; the count at 13, the channels behind

constexpr Field channelFields[] = {
    {"Transport Channel ID", u8At(0), integer("%d")},
    {"CRC Received", i32At(1), integer("%d")},
    {"CRC Received in Error", i32At(5), integer("%d")},
};
constexpr ListField channelList = {"Transport Channels", layout(9, channelFields)};

} // namespace

void BLER::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "BLER");
    if (logCode != 0x4116) {
        unknownLogMessage(logCode);
        return;
    }
    const Record record(data);
    if (!show(record, window))
        return;
    const CountedList channels(record, window.minimumLength, channelList.entry.minimumLength, record.u8(13));
    showList(channelList, channels, logCode);
}

} // namespace velmora
