// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Tracks/TrackFiles.h"

namespace velmora::trackFiles {

namespace {

constexpr int degreeDecimals = 7; ///< a centimetre

std::string placeAttributes(const Fix& fix) {
    return " lat=\"" + decimalText(fix.latitude, degreeDecimals) + "\" lon=\"" +
           decimalText(fix.longitude, degreeDecimals) + "\"";
}

std::string element(const char* name, const std::string& content) {
    return content.empty() ? std::string() : std::string("<") + name + ">" + content + "</" + name + ">";
}

std::string extensions(const TrackData& track, const TrackData::Point& point) {
    std::string content;
    if (point.fix.speed_mps)
        content += element("velmora:speed", decimalText(*point.fix.speed_mps, 2));
    if (point.fix.course_degrees)
        content += element("velmora:course", decimalText(*point.fix.course_degrees, 2));
    if (point.fix.deviation_m)
        content += element("velmora:deviation", decimalText(*point.fix.deviation_m, 2));
    for (std::size_t i = 0; i < point.values.size(); ++i) {
        const std::string value = valueText(point.values[i]);
        if (value.empty())
            continue;
        const TrackData::Attribute& attribute = track.attributes[i];
        content += "<velmora:value name=\"" + xmlText(attribute.name) + "\"" +
                   (attribute.unit.empty() ? "" : " unit=\"" + xmlText(attribute.unit) + "\"") + ">" +
                   xmlText(value) + "</velmora:value>";
    }
    return element("extensions", content);
}

std::string wayPoint(const TrackData::PlacedEvent& placed) {
    const Event& event = placed.event;
    return "<wpt" + placeAttributes(*placed.fix) + ">" + element("time", trackTime(event.time)) +
           element("name", xmlText(event.kind)) + element("desc", xmlText(event.text)) +
           element("type", std::string(nameOf(event.severity))) + "</wpt>\n";
}

} // namespace

std::string gpx(const TrackData& track) {
    std::string text = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                       "<gpx version=\"1.1\" creator=\"Velmora\" xmlns=\"http://www.topografix.com/GPX/1/1\" "
                       "xmlns:velmora=\"urn:velmora:track:1\">\n";
    text += element("metadata", element("name", xmlText(track.name))) + "\n";
    for (const TrackData::PlacedEvent& event : track.events)
        if (event.fix)
            text += wayPoint(event);
    text += "<trk>" + element("name", xmlText(track.name)) + "\n";
    for (const std::vector<TrackData::Point>& segment : track.segments) {
        text += "<trkseg>\n";
        for (const TrackData::Point& point : segment) {
            const Fix& fix = point.fix;
            text += "<trkpt" + placeAttributes(fix) + ">" +
                    (fix.altitude_m ? element("ele", decimalText(*fix.altitude_m, 2)) : "") +
                    element("time", trackTime(fix.time)) +
                    (fix.hdop ? element("hdop", decimalText(*fix.hdop, 2)) : "") + extensions(track, point) +
                    "</trkpt>\n";
        }
        text += "</trkseg>\n";
    }
    return text + "</trk>\n</gpx>\n";
}

} // namespace velmora::trackFiles
