// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Positions/NMEAValues.h"
#include "Recording/Positions/TrackFile.h"

#include <algorithm>
#include <charconv>
#include <chrono>
#include <cmath>
#include <cstddef>
#include <string>

#include <pugixml.hpp>

namespace velmora {

namespace {

constexpr double fullCircle = 360;

/// "line 3: ", where the offset is known.
std::string atLine(std::string_view content, std::ptrdiff_t offset) {
    return offset < 0 ? std::string()
                      : "line " + std::to_string(lineAt(content, static_cast<std::size_t>(offset))) + ": ";
}

/// The name without the prefix of its namespace.
std::string_view localName(const pugi::xml_node& node) {
    const std::string_view name = node.name();
    return name.substr(name.find(':') + 1);
}

pugi::xml_node child(const pugi::xml_node& node, std::string_view name) {
    return node.find_child([name](const pugi::xml_node& each) { return localName(each) == name; });
}

std::optional<double> numberOf(const pugi::xml_node& node) {
    return nmea::number(node.text().get());
}

/// Of a point itself, as GPX 1.0 has it, or of its extensions, at any depth of two.
std::optional<double> extension(const pugi::xml_node& point, std::string_view name) {
    if (const auto own = numberOf(child(point, name)))
        return own;
    for (const pugi::xml_node& each : child(point, "extensions").children()) {
        if (localName(each) == name)
            return numberOf(each);
        if (const auto inner = numberOf(child(each, name)))
            return inner;
    }
    return std::nullopt;
}

std::optional<Fix> fixOf(const pugi::xml_node& point) {
    const auto latitude = nmea::number(point.attribute("lat").value());
    const auto longitude = nmea::number(point.attribute("lon").value());
    const auto time = timeOfXML(child(point, "time").text().get());
    if (!latitude || !longitude || !time || std::abs(*latitude) > 90 || std::abs(*longitude) > 180)
        return std::nullopt;
    Fix fix;
    fix.time = *time;
    fix.latitude = *latitude;
    fix.longitude = *longitude == 180 ? -180 : *longitude;
    fix.altitude_m = numberOf(child(point, "ele"));
    if (const auto speed = extension(point, "speed"); speed && *speed >= 0)
        fix.speed_mps = speed;
    if (const auto course = extension(point, "course"); course && *course >= 0 && *course <= fullCircle)
        fix.course_degrees = std::fmod(*course, fullCircle);
    if (const auto hdop = numberOf(child(point, "hdop")); hdop && *hdop > 0)
        fix.hdop = hdop;
    return fix;
}

/// A number of exactly that many digits at the beginning of the text, which moves past it and the character
/// after it.
std::optional<int> part(std::string_view& text, std::size_t digits, std::string_view after) {
    int value = 0;
    if (text.size() < digits || text.find_first_not_of("0123456789") < digits)
        return std::nullopt;
    std::from_chars(text.data(), text.data() + digits, value);
    text.remove_prefix(digits);
    if (!after.empty() && (text.empty() || after.find(text.front()) == std::string_view::npos))
        return std::nullopt;
    text.remove_prefix(after.empty() ? 0 : 1);
    return value;
}

/// "Z", "+hh:mm" or "-hh:mm", or nothing.
std::optional<std::chrono::minutes> zoneOf(std::string_view text) {
    if (text.empty() || text == "Z")
        return std::chrono::minutes(0);
    const bool isWest = text.front() == '-';
    if (!isWest && text.front() != '+')
        return std::nullopt;
    text.remove_prefix(1);
    const auto hours = part(text, 2, ":");
    const auto minutes = hours ? part(text, 2, "") : std::nullopt;
    if (!minutes || !text.empty() || *hours > 14 || *minutes > 59)
        return std::nullopt;
    const std::chrono::minutes offset = std::chrono::hours(*hours) + std::chrono::minutes(*minutes);
    return isWest ? -offset : offset;
}

} // namespace

std::optional<Time> timeOfXML(std::string_view text) {
    const std::size_t begin = text.find_first_not_of(" \t\r\n");
    if (begin == std::string_view::npos)
        return std::nullopt;
    text = text.substr(begin, text.find_last_not_of(" \t\r\n") - begin + 1);
    const auto year = part(text, 4, "-");
    const auto month = year ? part(text, 2, "-") : std::nullopt;
    const auto day = month ? part(text, 2, "T") : std::nullopt;
    if (!day)
        return std::nullopt;
    // The clock is as NMEA has it, with colons.
    const std::size_t end = std::min(text.find_first_of("Z+-"), text.size());
    std::string clock(text.substr(0, end));
    if (clock.size() < 8 || clock[2] != ':' || clock[5] != ':')
        return std::nullopt;
    clock.erase(5, 1).erase(2, 1);
    const auto timeOfDay = nmea::timeOfDay(clock);
    const auto zone = zoneOf(text.substr(end));
    const auto digits = [](int number, std::size_t width) {
        const std::string plain = std::to_string(number);
        return std::string(width - plain.size(), '0') + plain;
    };
    const auto date = nmea::date(digits(*day, 2), digits(*month, 2), digits(*year, 4));
    if (!timeOfDay || !zone || !date)
        return std::nullopt;
    return Time(*date) + *timeOfDay - *zone;
}

Result<std::vector<Fix>> fixesOfGPX(std::string_view content) {
    pugi::xml_document document;
    const pugi::xml_parse_result parsed =
        document.load_buffer(content.data(), content.size(), pugi::parse_default, pugi::encoding_auto);
    if (!parsed)
        return Failure{atLine(content, parsed.offset) + "no GPX: " + parsed.description()};
    const pugi::xml_node root = document.document_element();
    if (localName(root) != "gpx")
        return Failure{atLine(content, root.offset_debug()) + "root element is " +
                       std::string(localName(root)) + ", wanted gpx"};
    std::vector<Fix> fixes;
    std::size_t points = 0;
    std::ptrdiff_t firstPoint = 0;
    for (const pugi::xml_node& track : root.children()) {
        if (localName(track) != "trk")
            continue;
        for (const pugi::xml_node& segment : track.children())
            for (const pugi::xml_node& point : segment.children()) {
                if (localName(point) != "trkpt")
                    continue;
                if (++points == 1)
                    firstPoint = point.offset_debug();
                if (const auto fix = fixOf(point))
                    fixes.push_back(*fix);
            }
    }
    if (fixes.empty() && points == 0)
        return Failure{"no track points"};
    if (fixes.empty())
        return Failure{atLine(content, firstPoint) + "none of " + std::to_string(points) +
                       " track points has a place and a time"};
    return fixes;
}

} // namespace velmora
