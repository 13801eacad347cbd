// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/TRCHBLERMeasurement.h"

#include "LogGenerator/UTRAN/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

namespace quality = UTRAN::quality;

namespace {

constexpr Field channelFields[] = {
    {"TRCH ID", u8At(0), integer("%d")},
    {"TRCH BLER Measurement", u8At(1), integer("%d")},
};
constexpr Layout channel = layout(quality::transportChannelLength, channelFields);

} // namespace

void TRCHBLERMeasurement::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Notice, "TRCH BLER Measurement"); // the one section whose line is a notice
    const Record record(data);
    if (logCode != quality::code || record.size() < quality::minimumLength)
        return;
    const CountedList channels(record, quality::minimumLength, quality::transportChannelLength,
                               static_cast<std::size_t>(quality::transportChannels.read(record)));
    showRows(channels, channel, logCode);
}

} // namespace velmora
