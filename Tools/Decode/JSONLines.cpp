// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/JSONLines.h"

#include "Tools/Text/JSONText.h"

#include <string>

namespace velmora {

namespace {

/// What every object begins with, up to its time.
std::string beginOf(const std::string& file) {
    TextBuffer text;
    text.append('{');
    if (!file.empty()) {
        text.append("\"file\":");
        appendJsonString(text, file);
        text.append(',');
    }
    text.append("\"time\":\"");
    return std::string(text.view());
}

/// Nothing to show is an empty display, so that a reader of the object finds one whatever the file held.
void appendDisplay(TextBuffer& line, const Value& display) {
    line.append(",\"display\":");
    if (display.isNone())
        line.append("{}");
    else
        appendJson(line, display);
}

} // namespace

RefreshLines::RefreshLines(Output& output, bool isLive, const NodeSelection& selection,
                           const std::string& file)
    : LineWriter(output, isLive), _selection(selection), _begin(beginOf(file)) {}

void RefreshLines::didRefresh(Time tick, const Decoded& decoded) {
    line().append(_begin);
    appendTime(tick);
    line().append("\",\"technology\":");
    appendJsonString(line(), decoded.technology);
    line().append(",\"messages\":");
    line().append(std::to_string(decoded.messages));
    appendDisplay(line(), _selection.restricted(decoded.display));
    endLine("}\n");
    LineWriter::didRefresh(tick, decoded);
}

MessageLines::MessageLines(Output& output, bool isLive, const std::string& file)
    : LineWriter(output, isLive), _begin(beginOf(file)) {}

void MessageLines::willConcern(const Decoded& decoded) {
    if (decoded.isOneOfSeveral)
        _technology = "\",\"technology\":\"" + decoded.technology;
}

void MessageLines::didDecode(const LoggedMessage&, LogGenerator&, Dictionary&) {
    endLine(_end);
}

void MessageLines::sections(std::optional<std::uint32_t> code) {
    begin();
    appendCode(code);
    line().append(",\"sections\":{");
}

void MessageLines::values(std::optional<std::uint32_t> code) {
    begin();
    appendCode(code);
    line().append(",\"values\":{");
}

void MessageLines::display(const Value& display) {
    begin();
    line().append('"');
    appendDisplay(line(), display);
    _end = "}\n";
}

void MessageLines::begin() {
    line().append(_begin);
    appendTime(_moment);
    line().append(_technology);
    _end = "}}\n";
    _first = true;
}

void MessageLines::appendCode(std::optional<std::uint32_t> code) {
    line().append("\",\"code\":");
    if (code)
        appendJson(line(), *code);
    else
        line().append("null");
}

void MessageLines::member(std::string_view name, const Value& value) {
    if (!_first)
        line().append(',');
    _first = false;
    appendJsonString(line(), name);
    line().append(':');
    appendJson(line(), value);
}

} // namespace velmora
