// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/XMLCellReader.h"

#include <algorithm>

namespace velmora {

namespace {

constexpr std::string_view head = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<plist version=\"1.0\">\n";
/// Well within every limit of the property-list reader.
constexpr std::size_t maximumLength = std::size_t{1} << 20;
constexpr std::size_t maximumSegmentLength = 2048;
constexpr std::size_t maximumDigits = 18;

/// Takes tags and texts off the front of a list.
class Tokens {
public:
    explicit Tokens(std::string_view text) : _rest(text) {}

    [[nodiscard]] std::string_view rest() const { return _rest; }
    [[nodiscard]] bool take(std::string_view token) {
        if (!_rest.starts_with(token))
            return false;
        _rest.remove_prefix(token.size());
        return true;
    }
    void passSpace() {
        const std::size_t end = _rest.find_first_not_of(" \t\n");
        _rest.remove_prefix(std::min(end, _rest.size()));
    }
    /// A tag after white space.
    [[nodiscard]] bool tag(std::string_view token) {
        passSpace();
        return take(token);
    }
    /// Plain text up to the closing tag, which is removed too.
    [[nodiscard]] bool text(std::string_view closing, std::string_view& text) {
        std::size_t end = 0;
        while (end < _rest.size() && _rest[end] >= ' ' && _rest[end] <= '~' && _rest[end] != '<' &&
               _rest[end] != '&' && _rest[end] != '>')
            ++end;
        text = _rest.substr(0, end);
        _rest.remove_prefix(end);
        return take(closing);
    }

private:
    std::string_view _rest;
};

/// The digits at the front of `rest`, with a sign; 0 where there are none or too many.
std::size_t numberLength(std::string_view rest, std::int64_t& number) {
    const std::size_t first = !rest.empty() && rest[0] == '-' ? 1 : 0;
    std::size_t end = first;
    std::int64_t value = 0;
    for (; end < rest.size() && rest[end] >= '0' && rest[end] <= '9'; ++end) {
        if (end - first == maximumDigits)
            return 0;
        value = value * 10 + (rest[end] - '0');
    }
    number = first == 1 ? -value : value;
    return end == first ? 0 : end;
}

} // namespace

bool XMLCellReader::read(std::string_view text, std::vector<Cell>& cells) {
    if (text.size() > maximumLength)
        return false;
    for (std::size_t at = 0;;) {
        const Segment* segment = segmentAt(text.substr(at), at == 0);
        if (!segment)
            return false;
        at += segment->text.size();
        for (const Step& step : segment->steps) {
            switch (step.kind) {
            case Step::Kind::BeginCell: cells.emplace_back(); break;
            case Step::Kind::Technology: cells.back().kind.technology = step.value; break;
            case Step::Kind::Type: cells.back().kind.type = step.value; break;
            case Step::Kind::NotANumber: cells.back().clearNumber(step.value); break;
            }
        }
        if (segment->number == noNumber)
            return at == text.size();
        std::int64_t number = 0;
        const std::size_t length = numberLength(text.substr(at), number);
        if (length == 0)
            return false;
        at += length;
        if (segment->number != unknownNumber)
            cells.back().setNumber(segment->number, number);
    }
}

const XMLCellReader::Segment* XMLCellReader::segmentAt(std::string_view rest, bool begins) {
    const auto fits = [&](std::size_t index) {
        return index < _segments.size() && _segments[index].begins == begins &&
               rest.starts_with(_segments[index].text);
    };
    std::size_t found = _last < _segments.size() ? _segments[_last].next : 0;
    if (!fits(found)) {
        for (found = 0; found < _segments.size() && !fits(found);)
            ++found;
        if (found == _segments.size()) {
            if (_segments.size() == maximumSegments)
                _segments.clear(); // what follows is cached again
            if (!addSegment(rest, begins))
                return nullptr;
            found = _segments.size() - 1;
        }
        if (_last < _segments.size())
            _segments[_last].next = found;
    }
    _last = found;
    return &_segments[found];
}

/// Parses the segment at the start of `rest`. There is a current cell, unless the list starts.
bool XMLCellReader::addSegment(std::string_view rest, bool begins) {
    Segment segment;
    segment.begins = begins;
    const auto note = [&segment](Step::Kind kind, std::size_t value) {
        segment.steps.push_back({kind, static_cast<std::uint8_t>(value)});
    };
    Tokens tokens(rest.substr(0, maximumSegmentLength));
    if (begins) {
        if (!tokens.take(head) || !tokens.tag("<array>") || !tokens.tag("<dict>"))
            return false;
        note(Step::Kind::BeginCell, 0);
    } else if (!tokens.take("</integer>")) {
        return false;
    }
    for (;;) {
        if (tokens.tag("</dict>")) {
            if (tokens.tag("<dict>")) {
                note(Step::Kind::BeginCell, 0);
                continue;
            }
            if (!tokens.tag("</array>") || !tokens.tag("</plist>"))
                return false;
            tokens.passSpace();
            break;
        }
        std::string_view key;
        std::string_view value;
        if (!tokens.tag("<key>") || !tokens.text("</key>", key))
            return false;
        const std::size_t number = indexOf(key, cellNumberKeys);
        if (tokens.tag("<integer>")) {
            // A number is neither technology nor type.
            if (key == kVoxCellMonitorCellRadioAccessTechnology || key == kVoxCellMonitorCellType)
                return false;
            segment.number = number < cellNumberCount ? static_cast<std::uint8_t>(number) : unknownNumber;
            break;
        }
        if (!tokens.tag("<string>") || !tokens.text("</string>", value))
            return false;
        if (key == kVoxCellMonitorCellRadioAccessTechnology)
            note(Step::Kind::Technology, indexOf(value, cellTechnologies));
        else if (key == kVoxCellMonitorCellType)
            note(Step::Kind::Type, indexOf(value, cellTypes));
        else if (number < cellNumberCount)
            note(Step::Kind::NotANumber, number);
    }
    const std::size_t length = std::min(rest.size(), maximumSegmentLength) - tokens.rest().size();
    segment.text = rest.substr(0, length);
    _segments.push_back(std::move(segment));
    return true;
}

} // namespace velmora
