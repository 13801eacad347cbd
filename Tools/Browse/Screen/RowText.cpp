// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Screen/RowText.h"

#include "Platform/DateText.h"

#include <chrono>
#include <cinttypes>
#include <cstdint>
#include <cstdio>

namespace velmora {

std::string timeOfDay(Time time) {
    const auto seconds = std::chrono::floor<std::chrono::seconds>(time);
    const auto milliseconds = std::chrono::floor<std::chrono::milliseconds>(time - seconds);
    char fraction[8];
    std::snprintf(fraction, sizeof fraction, ".%03d", static_cast<int>(milliseconds.count()));
    const std::string date = dateAndTimeText(seconds, " ");
    return date.substr(date.find(' ') + 1) + fraction;
}

std::string differenceText(Time::duration difference) {
    const bool isBack = difference.count() < 0;
    // The least duration has no positive counterpart.
    const std::uint64_t length = isBack ? 0 - static_cast<std::uint64_t>(difference.count())
                                        : static_cast<std::uint64_t>(difference.count());
    const std::uint64_t milliseconds = length / 1'000'000;
    char text[40];
    std::snprintf(text, sizeof text, "%c%" PRIu64 ".%03" PRIu64, isBack ? '-' : '+', milliseconds / 1000,
                  milliseconds % 1000);
    return text;
}

std::string codeText(const MessageRow& row) {
    if (!row.code)
        return "no code";
    char text[16];
    std::snprintf(text, sizeof text, "0x%04X", static_cast<unsigned>(*row.code));
    return text;
}

std::string rowText(const MessageRow& row) {
    char columns[96];
    std::snprintf(columns, sizeof columns, "%c%9" PRIu64 "  %s %9s  %-8s  ", row.isMarked ? '|' : ' ',
                  row.position + 1, timeOfDay(row.time).c_str(),
                  row.difference ? differenceText(*row.difference).c_str() : "", codeText(row).c_str());
    std::string text = columns + row.name;
    if (!row.note.empty())
        text += (row.name.empty() ? "* " : "  * ") + row.note;
    return text;
}

std::string placeText(const FieldPlace& place) {
    std::string text = place.end - place.begin == 1
                           ? "byte " + std::to_string(place.begin)
                           : "bytes " + std::to_string(place.begin) + " to " + std::to_string(place.end - 1);
    if (place.bit == 0 && place.width % 8 == 0)
        return text;
    if (place.width == 1)
        return text + ", bit " + std::to_string(place.bit);
    return text + ", bits " + std::to_string(place.bit) + " to " +
           std::to_string(place.bit + place.width - 1);
}

std::string fieldText(const ReportedField& field) {
    std::string text = field.path + " = " + field.text;
    if (field.place)
        text += " (" + placeText(*field.place) + ")";
    return text;
}

std::string eventText(const BrowsedEvent& event) {
    std::string text = timeOfDay(event.time) + " ";
    if (event.severity != Severity::Info)
        text += std::string(nameOf(event.severity)) + " ";
    return text + event.kind + ": " + event.text;
}

} // namespace velmora
