// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Tracks/DateLine.h"
#include "Export/Tracks/TrackColours.h"
#include "Export/Tracks/TrackFiles.h"

namespace velmora::trackFiles {

namespace {

constexpr int degreeDecimals = 7; ///< a centimetre

std::string coordinate(double longitude, double latitude) {
    return decimalText(longitude, degreeDecimals) + "," + decimalText(latitude, degreeDecimals);
}

std::string element(const char* name, const std::string& content) {
    return std::string("<") + name + ">" + content + "</" + name + ">";
}

/// One colour: the points of a run, and the first of the next, so that the runs join.
std::string run(const std::vector<TrackData::Point>& points, const TrackColours& colours,
                std::size_t colour) {
    std::string lines;
    for (const std::vector<LinePoint>& line : linesOf(points)) {
        std::string places;
        for (const auto& [longitude, latitude] : line)
            places += (places.empty() ? "" : " ") + coordinate(longitude, latitude);
        lines += element("LineString", element("tessellate", "1") + element("coordinates", places));
    }
    if (lines.empty())
        return {};
    return element("Placemark",
                   element("name", xmlText(colours.label(colour))) +
                       element("TimeSpan", element("begin", trackTime(points.front().fix.time)) +
                                               element("end", trackTime(points.back().fix.time))) +
                       element("styleUrl", "#" + TrackColours::style(colour)) +
                       element("MultiGeometry", lines)) +
           "\n";
}

std::string segmentText(const std::vector<TrackData::Point>& segment, const TrackColours& colours) {
    std::string text;
    std::vector<TrackData::Point> points;
    std::size_t colour = 0;
    for (const TrackData::Point& point : segment) {
        const std::size_t next = colours.of(point);
        points.push_back(point);
        if (points.size() > 1 && next != colour) {
            text += run(points, colours, colour);
            points.erase(points.begin(), points.end() - 1);
        }
        colour = next;
    }
    return text + run(points, colours, colour);
}

std::string eventText(const TrackData::PlacedEvent& placed) {
    const Event& event = placed.event;
    return element("Placemark",
                   element("name", xmlText(event.kind)) + element("description", xmlText(event.text)) +
                       element("TimeStamp", element("when", trackTime(event.time))) +
                       element("ExtendedData", "<Data name=\"severity\">" +
                                                   element("value", std::string(nameOf(event.severity))) +
                                                   "</Data>") +
                       element("Point", element("coordinates",
                                                coordinate(placed.fix->longitude, placed.fix->latitude)))) +
           "\n";
}

} // namespace

std::string kml(const TrackData& track) {
    const TrackColours colours(track);
    std::string text = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                       "<kml xmlns=\"http://www.opengis.net/kml/2.2\"><Document>\n";
    text += element("name", xmlText(track.name)) + "\n";
    for (std::size_t colour = 0; colour < colours.count(); ++colour)
        text += "<Style id=\"" + TrackColours::style(colour) + "\">" +
                element("LineStyle", element("color", colours.colour(colour)) + element("width", "4")) +
                "</Style>\n";
    text += "<Folder>" + element("name", "track") + "\n";
    for (const std::vector<TrackData::Point>& segment : track.segments)
        text += segmentText(segment, colours);
    text += "</Folder>\n<Folder>" + element("name", "events") + "\n";
    for (const TrackData::PlacedEvent& event : track.events)
        if (event.fix)
            text += eventText(event);
    return text + "</Folder>\n</Document></kml>\n";
}

} // namespace velmora::trackFiles
