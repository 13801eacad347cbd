// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/CCTRCHSIRMeasurement.h"

#include "LogGenerator/UTRAN/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

namespace quality = UTRAN::quality;

namespace {

// 0xD00C: coded composite channel and time slot, as the modem reports them.
constexpr Field channelFields[] = {
    {"CCTRCH ID", u8At(0), integer("%d")},
    {"TSNUM", u8At(1), integer("%d")},
};
constexpr Layout channel = layout(quality::compositeChannelLength, channelFields);

/// SIR (a quantity of 3GPP TS 25.225), as the modem reports it.
constexpr Field ratio[] = {
    {"", u8At(2), integer("%d")}, {"", u8At(3), integer("%d")}, {"", u8At(4), integer("%d")},
    {"", u8At(5), integer("%d")}, {"", u8At(6), integer("%d")}, {"", u8At(7), integer("%d")},
};
static_assert(ratio[5].place.end() == quality::compositeChannelLength);
constexpr Content ratioContents[] = {ratio};
constexpr List ratios{"SIR", List::Entries::Values, "", ratioContents};
constexpr Content channelContents[] = {channel, ratios};
constexpr std::string_view channelKeys[] = {"CCTRCH ID"};
constexpr List rows{.contents = channelContents, .keys = channelKeys};
constexpr Content contents[] = {rows};

CountedList compositeChannels(const Record& record) {
    const auto transportChannels = static_cast<std::size_t>(quality::transportChannels.read(record));
    return CountedList(record, quality::firstCompositeChannel(transportChannels),
                       quality::compositeChannelLength,
                       static_cast<std::size_t>(quality::compositeChannels.read(record)));
}

constexpr View sectionViews[] = {{quality::code, quality::minimumLength, contents}};

} // namespace

std::span<const View> CCTRCHSIRMeasurement::views() const {
    return sectionViews;
}

void CCTRCHSIRMeasurement::trace() const {
    logLine(LogPriority::Warning, "CCTRCH SIR Measurement");
}

void CCTRCHSIRMeasurement::unknownCode(std::uint32_t) const {}

void CCTRCHSIRMeasurement::check(const View& view, const Record& record) const {
    reportMissingEntries(compositeChannels(record), view.code);
}

void CCTRCHSIRMeasurement::decode(const View&, const Record& record, FieldVisitor& visitor) const {
    const CountedList channels = compositeChannels(record);
    visitor.beginList(rows);
    for (std::size_t i = 0; i < channels.completeCount(); ++i) {
        visitor.beginRow();
        visitor.fields(channels[i], channel);
        visitor.beginList(ratios);
        for (const Field& each : ratio)
            visitor.number(each, each.place.read(channels[i]));
        visitor.endList();
        visitor.endRow();
    }
    visitor.endList();
}

} // namespace velmora
