// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Tracks/DateLine.h"
#include "Export/Tracks/TrackFiles.h"
#include "Platform/UTF8.h"

#include <cstdio>
#include <optional>

namespace velmora::trackFiles {

namespace {

constexpr int degreeDecimals = 7; ///< a centimetre

std::string inQuotes(std::string_view text) {
    std::string escaped = "\"";
    for (std::size_t at = 0; at < text.size();) {
        const std::size_t begin = at;
        const std::optional<char32_t> character = nextCharacter(text, at);
        if (!character) {
            escaped += "\\ufffd";
            ++at;
        } else if (*character < 0x20) {
            char code[8];
            std::snprintf(code, sizeof code, "\\u%04x", static_cast<unsigned>(*character));
            escaped += code;
        } else {
            if (*character == '"' || *character == '\\')
                escaped += '\\';
            escaped += text.substr(begin, at - begin);
        }
    }
    return escaped + '"';
}

std::string position(double longitude, double latitude, std::optional<double> altitude_m = {}) {
    return "[" + decimalText(longitude, degreeDecimals) + "," + decimalText(latitude, degreeDecimals) +
           (altitude_m ? "," + decimalText(*altitude_m, 2) : "") + "]";
}

std::string pointGeometry(const Fix& fix) {
    return R"({"type":"Point","coordinates":)" + position(fix.longitude, fix.latitude, fix.altitude_m) + "}";
}

std::string member(std::string_view name, const std::string& value) {
    return "," + inQuotes(name) + ":" + value;
}

std::string optionalMember(std::string_view name, std::optional<double> value) {
    return value ? member(name, decimalText(*value, 2)) : std::string();
}

std::string feature(const std::string& geometry, const char* kind, const std::string& members) {
    return R"({"type":"Feature","geometry":)" + geometry + R"(,"properties":{"feature":")" + kind + "\"" +
           members + "}}";
}

std::string fixFeature(const TrackData& track, const TrackData::Point& point) {
    const Fix& fix = point.fix;
    std::string members = member("time", inQuotes(trackTime(fix.time))) +
                          optionalMember("speed", fix.speed_mps) +
                          optionalMember("course", fix.course_degrees) + optionalMember("hdop", fix.hdop) +
                          optionalMember("deviation", fix.deviation_m);
    for (std::size_t i = 0; i < point.values.size(); ++i) {
        const TrackData::Value& value = point.values[i];
        const std::string text = valueText(value);
        const bool isNumber = std::holds_alternative<double>(value);
        members += member(track.attributes[i].name, text.empty() ? "null" : isNumber ? text : inQuotes(text));
    }
    return feature(pointGeometry(fix), "fix", members);
}

std::string lineFeature(const std::vector<TrackData::Point>& segment) {
    const std::vector<std::vector<LinePoint>> lines = linesOf(segment);
    if (lines.empty())
        return {};
    std::string coordinates;
    for (const std::vector<LinePoint>& line : lines) {
        std::string places;
        for (const auto& [longitude, latitude] : line)
            places += (places.empty() ? "" : ",") + position(longitude, latitude);
        coordinates += (coordinates.empty() ? "[" : ",[") + places + "]";
    }
    const std::string geometry = lines.size() == 1
                                     ? R"({"type":"LineString","coordinates":)" + coordinates + "}"
                                     : R"({"type":"MultiLineString","coordinates":[)" + coordinates + "]}";
    return feature(geometry, "track",
                   member("time", inQuotes(trackTime(segment.front().fix.time))) +
                       member("end", inQuotes(trackTime(segment.back().fix.time))));
}

std::string eventFeature(const TrackData::PlacedEvent& placed) {
    const Event& event = placed.event;
    return feature(
        placed.fix ? pointGeometry(*placed.fix) : "null", "event",
        member("time", inQuotes(trackTime(event.time))) +
            (event.end ? member("end", inQuotes(trackTime(*event.end))) : "") +
            member("kind", inQuotes(event.kind)) + member("severity", inQuotes(nameOf(event.severity))) +
            member("text", inQuotes(event.text)) + member("technology", inQuotes(event.technology)));
}

} // namespace

std::string geoJSON(const TrackData& track) {
    std::string text = "{\"type\":\"FeatureCollection\",\"features\":[";
    bool isFirst = true;
    const auto add = [&](const std::string& one) {
        if (one.empty())
            return;
        text += isFirst ? "\n" : ",\n";
        text += one;
        isFirst = false;
    };
    for (const std::vector<TrackData::Point>& segment : track.segments)
        add(lineFeature(segment));
    for (const std::vector<TrackData::Point>& segment : track.segments)
        for (const TrackData::Point& point : segment)
            add(fixFeature(track, point));
    for (const TrackData::PlacedEvent& event : track.events)
        add(eventFeature(event));
    return text + "\n]}\n";
}

} // namespace velmora::trackFiles
