// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/TRCHBLERMeasurement.h"

#include "LogGenerator/UTRAN/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

namespace quality = UTRAN::quality;

namespace {

// 0xD00C: transport channel BLER (a quantity of 3GPP TS 25.225), as the modem reports it.
constexpr Field channelFields[] = {
    {"TRCH ID", u8At(0), integer("%d")},
    {"TRCH BLER Measurement", u8At(1), integer("%d")},
};
constexpr Layout channel = layout(quality::transportChannelLength, channelFields);
constexpr Content channelContents[] = {channel};
constexpr std::string_view channelKeys[] = {"TRCH ID"};
constexpr List rows{.contents = channelContents, .keys = channelKeys};
constexpr Content contents[] = {rows};

CountedList channels(const Record& record) {
    return CountedList(record, quality::minimumLength, quality::transportChannelLength,
                       static_cast<std::size_t>(quality::transportChannels.read(record)));
}

constexpr View sectionViews[] = {{quality::code, quality::minimumLength, contents}};

} // namespace

std::span<const View> TRCHBLERMeasurement::views() const {
    return sectionViews;
}

void TRCHBLERMeasurement::trace() const {
    logLine(LogPriority::Notice, "TRCH BLER Measurement"); // the one section whose line is a notice
}

void TRCHBLERMeasurement::unknownCode(std::uint32_t) const {}

void TRCHBLERMeasurement::check(const View& view, const Record& record) const {
    reportMissingEntries(channels(record), view.code);
}

void TRCHBLERMeasurement::decode(const View&, const Record& record, FieldVisitor& visitor) const {
    visitor.rows(rows, channels(record), channel);
}

} // namespace velmora
