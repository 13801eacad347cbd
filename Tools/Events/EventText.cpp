// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/EventText.h"

#include "Platform/PrintableText.h"
#include "Tools/Decode/Samples/SampleText.h"
#include "Tools/Report.h"

#include <charconv>
#include <chrono>
#include <cstdio>

namespace velmora {

namespace {

/// The widths of columns; longer texts move what follows them.
constexpr std::size_t durationWidth = 10;
constexpr std::size_t severityWidth = 8;
constexpr std::size_t kindWidth = 18;
constexpr std::size_t technologyWidth = 13;
constexpr std::size_t placeWidth = 22;

/// "12.3 s" of an event that lasts; nothing of one that happens at a moment.
std::string durationOf(const Event& event, EventState state) {
    if (!event.lasts)
        return {};
    if (state == EventState::Begins)
        return "begins";
    if (!event.end)
        return "no end";
    char text[32];
    std::snprintf(text, sizeof text, "%.1f s",
                  std::chrono::duration<double>(*event.end - event.time).count());
    return text;
}

/// "59.333333 -18.050000": latitude and longitude, empty where they are not known.
std::string placeText(const std::optional<Coordinates>& place) {
    if (!place)
        return {};
    char text[64];
    std::snprintf(text, sizeof text, "%.6f %.6f", place->latitude, place->longitude);
    return text;
}

} // namespace

std::string textOf(const EventField::Value& value) {
    if (const auto* const flag = std::get_if<bool>(&value))
        return *flag ? "true" : "false";
    if (const auto* const text = std::get_if<std::string>(&value))
        return *text;
    TextBuffer out;
    appendNumber(out, std::get<double>(value));
    return std::string(out.view());
}

std::string evidenceText(const Event& event, const EvidenceNames& names) {
    std::string text;
    for (const MessageNumber& message : event.evidence) {
        text += text.empty() ? "" : " ";
        if (names.files.size() > 1)
            text.append(names.fileOf(message)).append(":");
        text += std::to_string(message.number);
    }
    return text;
}

void EventText::append(const Event& event, EventState state) {
    TimeText time;
    TextBuffer moment;
    time.append(moment, event.time);
    line().append(moment.view().substr(0, std::string_view("2026-11-16T05:00:00.000").size()));
    line().append("Z  ");
    const std::string duration = durationOf(event, state);
    for (std::size_t width = displayWidth(duration); width < durationWidth; ++width)
        line().append(' ');
    appendPadded(duration, 0);
    appendPadded(nameOf(event.severity), severityWidth);
    appendPadded(printable(event.kind), kindWidth);
    if (_hasSeveralTechnologies())
        appendPadded(printable(event.technology), technologyWidth);
    if (_columns.hasPlace)
        appendPadded(placeText(place()), placeWidth);
    line().append(printable(event.text));
    if (_columns.hasEvidence && !event.evidence.empty()) {
        line().append("  [");
        line().append(printable(evidenceText(event, _names)));
        line().append(']');
    }
    line().append('\n');
}

void EventText::appendPadded(std::string_view text, std::size_t columns) {
    line().append(text);
    for (std::size_t width = displayWidth(text); width < columns; ++width)
        line().append(' ');
    line().append("  ");
}

} // namespace velmora
