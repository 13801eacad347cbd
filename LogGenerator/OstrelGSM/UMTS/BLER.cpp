// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/BLER.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

// 0x4116: transport channels (3GPP TS 25.302); counters as the modem reports them.
constexpr Field windowFields[] = {
    {"Window Size", u16At(14), integer("%d")},
};
constexpr Layout window = layout(16, windowFields); // the count at 13, the channels after it

constexpr Field channelFields[] = {
    {"Transport Channel ID", u8At(0), integer("%d"), {.clause = "3GPP TS 25.302"}},
    {"CRC Received", i32At(1), integer("%d")},
    {"CRC Received in Error", i32At(5), integer("%d")},
};
constexpr Layout channel = layout(9, channelFields);
constexpr Content channelContents[] = {channel};
constexpr std::string_view channelKeys[] = {"Transport Channel ID"};
constexpr List channelList{.label = "Transport Channels", .contents = channelContents, .keys = channelKeys};
constexpr Content contents[] = {window, channelList};

CountedList channels(const Record& record) {
    return CountedList(record, window.minimumLength, channel.minimumLength, record.u8(13));
}

constexpr View sectionViews[] = {{0x4116, window.minimumLength, contents}};

} // namespace

std::span<const View> BLER::views() const {
    return sectionViews;
}

void BLER::trace() const {
    logLine(LogPriority::Warning, "BLER");
}

void BLER::check(const View& view, const Record& record) const {
    reportMissingEntries(channels(record), view.code);
}

void BLER::decode(const View&, const Record& record, FieldVisitor& visitor) const {
    visitor.fields(record, window);
    visitor.rows(channelList, channels(record), channel);
}

} // namespace velmora
