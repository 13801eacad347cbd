// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/CCTRCHSIRMeasurement.h"

#include "LogGenerator/UTRAN/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

namespace quality = UTRAN::quality;

namespace {

constexpr Field channelFields[] = {
    {"CCTRCH ID", u8At(0), integer("%d")},
    {"TSNUM", u8At(1), integer("%d")},
};
constexpr Layout channel = layout(quality::compositeChannelLength, channelFields);

constexpr std::size_t firstRatio = 2;
constexpr std::size_t ratioCount = 6;
static_assert(firstRatio + ratioCount == quality::compositeChannelLength);

Array ratios(const Record& entry) {
    const CountedList values(entry, firstRatio, 1, ratioCount);
    Array result;
    for (std::size_t i = 0; i < ratioCount; ++i)
        result.append(NumberText("%d", std::int64_t{values[i].u8(0)}).text());
    return result;
}

CountedList compositeChannels(const Record& record) {
    const auto transportChannels = static_cast<std::size_t>(quality::transportChannels.read(record));
    return CountedList(record, quality::firstCompositeChannel(transportChannels),
                       quality::compositeChannelLength,
                       static_cast<std::size_t>(quality::compositeChannels.read(record)));
}

void fill(Array& rows, const Record& record) {
    const CountedList channels = compositeChannels(record);
    for (std::size_t i = 0; i < channels.whole(); ++i) {
        Dictionary& row = rows.appendRow();
        writeFields(row, channels[i], channel);
        row.set("SIR", std::make_shared<Array>(ratios(channels[i])));
    }
}

} // namespace

void CCTRCHSIRMeasurement::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "CCTRCH SIR Measurement");
    const Record record(data);
    if (logCode != quality::code || record.size() < quality::minimumLength)
        return;
    reportMissingEntries(compositeChannels(record), logCode);
    showElementsWith<fill>(record);
}

} // namespace velmora
