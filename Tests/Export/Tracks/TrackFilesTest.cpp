// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Tracks/TrackFiles.h"

#include "Export/Tracks/DateLine.h"
#include "Export/Tracks/TrackColours.h"

#include <chrono>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::Not;
using testing::Pair;

TrackData::Point pointAt(std::chrono::seconds time, double latitude, double longitude,
                         TrackData::Value value = {}) {
    TrackData::Point point;
    point.fix.time = Time(time);
    point.fix.latitude = latitude;
    point.fix.longitude = longitude;
    point.values.push_back(std::move(value));
    return point;
}

TrackData trackOf(std::vector<TrackData::Point> points) {
    TrackData track;
    track.name = "drive.pcapng";
    track.attributes.push_back({"level", "dBm"});
    track.segments.push_back(std::move(points));
    return track;
}

TEST(TrackFiles, cutALineAtTheDateLine) {
    const auto lines = linesOf({pointAt(0s, 10, 179.5), pointAt(1s, 11, -179.5), pointAt(2s, 11, -179.25)});
    ASSERT_EQ(lines.size(), 2U);
    EXPECT_THAT(lines[0], ElementsAre(Pair(179.5, 10.0), Pair(180.0, 10.5)));
    EXPECT_THAT(lines[1], ElementsAre(Pair(-180.0, 10.5), Pair(-179.5, 11.0), Pair(-179.25, 11.0)));
    const auto west = linesOf({pointAt(0s, 0, -179), pointAt(1s, 4, 177)});
    ASSERT_EQ(west.size(), 2U);
    EXPECT_THAT(west[0], ElementsAre(Pair(-179.0, 0.0), Pair(-180.0, 1.0)));
    EXPECT_THAT(west[1], ElementsAre(Pair(180.0, 1.0), Pair(177.0, 4.0)));
    EXPECT_TRUE(linesOf({pointAt(0s, 1, 1)}).empty());
    EXPECT_THAT(
        trackFiles::geoJSON(trackOf({pointAt(0s, 10, 179.5), pointAt(1s, 11, -179.5)})),
        HasSubstr(R"("MultiLineString","coordinates":[[[179.5,10],[180,10.5]],[[-180,10.5],[-179.5,11]]])"));
}

TEST(TrackFiles, escapeWhatAFormCannotHold) {
    TrackData track = trackOf({pointAt(0s, 1, 2, std::string("a<b>&\"c\"\x01\xFF]]>")), pointAt(1s, 1, 2)});
    track.name = "</name><script>";
    const std::string bad = "\xEF\xBF\xBD";
    EXPECT_THAT(trackFiles::gpx(track), HasSubstr(">a&lt;b&gt;&amp;&quot;c&quot;" + bad + bad + "]]&gt;<"));
    EXPECT_THAT(trackFiles::gpx(track), Not(HasSubstr("<script>")));
    EXPECT_THAT(trackFiles::kml(track), Not(HasSubstr("<script>")));
    EXPECT_THAT(trackFiles::geoJSON(track), HasSubstr(R"("level":"a<b>&\"c\"\u0001\ufffd]]>")"));
}

TEST(TrackFiles, haveNoValueWhereThereIsNone) {
    const TrackData track = trackOf({pointAt(0s, 1, 2, -97.25), pointAt(1s, 1, 2.5)});
    EXPECT_THAT(trackFiles::geoJSON(track), HasSubstr(R"("level":-97.25)"));
    EXPECT_THAT(trackFiles::geoJSON(track), HasSubstr(R"("level":null)"));
    EXPECT_THAT(trackFiles::gpx(track),
                HasSubstr(R"(<velmora:value name="level" unit="dBm">-97.25</velmora:value>)"));
}

TEST(TrackFiles, haveEventsWithoutAPlaceInGeoJSONAlone) {
    TrackData track = trackOf({pointAt(0s, 1, 2), pointAt(1s, 1, 2)});
    TrackData::PlacedEvent placed;
    placed.event.kind = "gap";
    placed.event.text = "no messages";
    track.events.push_back(placed);
    EXPECT_THAT(trackFiles::geoJSON(track), HasSubstr(R"("geometry":null,"properties":{"feature":"event")"));
    EXPECT_THAT(trackFiles::gpx(track), Not(HasSubstr("<wpt")));
    EXPECT_THAT(trackFiles::kml(track), Not(HasSubstr("<Point>")));
    track.events.front().fix = track.segments.front().front().fix;
    EXPECT_THAT(trackFiles::gpx(track),
                HasSubstr(R"(<wpt lat="1" lon="2"><time>1970-01-01T00:00:00Z</time><name>gap</name>)"));
    EXPECT_THAT(trackFiles::kml(track), HasSubstr("<Point><coordinates>2,1</coordinates></Point>"));
}

TEST(TrackColours, divideNumbersIntoFiveClasses) {
    const TrackData track = trackOf({pointAt(0s, 1, 2, -100.0), pointAt(1s, 1, 2, -50.0), pointAt(2s, 1, 2)});
    const TrackColours colours(track);
    EXPECT_EQ(colours.of(pointAt(0s, 1, 2, -100.0)), 1U);
    EXPECT_EQ(colours.of(pointAt(0s, 1, 2, -90.1)), 1U);
    EXPECT_EQ(colours.of(pointAt(0s, 1, 2, -90.0)), 2U);
    EXPECT_EQ(colours.of(pointAt(0s, 1, 2, -50.0)), 5U);
    EXPECT_EQ(colours.of(pointAt(0s, 1, 2)), 0U);
    EXPECT_EQ(colours.label(2), "level (dBm): -90 to -80");
    EXPECT_EQ(colours.label(0), "level (dBm): none");
}

TEST(TrackNumbers, haveTheDecimalsThatAreNeeded) {
    EXPECT_EQ(decimalText(59.33, 7), "59.33");
    EXPECT_EQ(decimalText(-0.00000001, 7), "0");
    EXPECT_EQ(decimalText(100, 7), "100");
    EXPECT_EQ(decimalText(1.23456789, 7), "1.2345679");
    EXPECT_EQ(trackTime(Time(1'794'805'200'250ms)), "2026-11-16T05:00:00.250Z");
    EXPECT_EQ(trackTime(Time(1'794'805'200s)), "2026-11-16T05:00:00Z");
}

} // namespace
} // namespace velmora
