// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Positions/TrackFile.h"

#include "Tests/Support/NMEA.h"

#include <chrono>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono;

constexpr sys_days day = November / 22 / 2026;

std::string reasonOf(const Result<std::vector<Fix>>& fixes) {
    return fixes ? "success" : fixes.reason();
}

TEST(TrackFile, readsTheTimesOfXML) {
    EXPECT_EQ(timeOfXML("2026-11-22T09:05:07Z"), day + 9h + 5min + 7s);
    EXPECT_EQ(timeOfXML(" 2026-11-22T09:05:07.25Z\n"), day + 9h + 5min + 7s + 250ms);
    EXPECT_EQ(timeOfXML("2026-11-22T10:35:07+01:30"), day + 9h + 5min + 7s);
    EXPECT_EQ(timeOfXML("2026-11-22T00:05:07-09:00"), day + 9h + 5min + 7s);
    EXPECT_EQ(timeOfXML("2026-11-22T09:05:07"), day + 9h + 5min + 7s);
    for (const char* const text : {"", "2026-11-22", "2026-11-22 09:05:07Z", "2026-02-30T09:05:07Z",
                                   "2026-11-22T24:05:07Z", "2026-11-22T09:05Z", "2026-11-22T09:05:07+1:00",
                                   "1900-11-22T09:05:07Z", "2026-11-22T09:05:07ZZ", "2026-11-22T09-05-07Z"})
        EXPECT_FALSE(timeOfXML(text)) << text;
}

TEST(TrackFile, readsThePointsOfGPXThatHaveATime) {
    const auto fixes = fixesOfTrackFile(R"(<?xml version="1.0"?>
        <gpx version="1.1" creator="test" xmlns="http://www.topografix.com/GPX/1/1">
          <wpt lat="1" lon="1"><time>2026-11-22T09:00:00Z</time></wpt>
          <trk><trkseg>
            <trkpt lat="59.5" lon="180"><ele>12.5</ele><time>2026-11-22T09:00:02Z</time><hdop>0.9</hdop>
              <extensions><x:TrackPoint><x:speed>23.5</x:speed><x:course>360</x:course></x:TrackPoint></extensions></trkpt>
            <trkpt lat="59.25" lon="-18.5"><time>2026-11-22T09:00:01Z</time></trkpt>
            <trkpt lat="59.25" lon="18"></trkpt>
            <trkpt lat="90.5" lon="18"><time>2026-11-22T09:00:01Z</time></trkpt>
            <trkpt lat="59.25" lon="east"><time>2026-11-22T09:00:01Z</time></trkpt>
          </trkseg></trk>
        </gpx>)");
    ASSERT_EQ(reasonOf(fixes), "success");
    ASSERT_EQ(fixes->size(), 2U);
    EXPECT_EQ((*fixes)[0].time, day + 9h + 1s);
    EXPECT_EQ((*fixes)[0].longitude, -18.5);
    EXPECT_FALSE((*fixes)[0].altitude_m || (*fixes)[0].speed_mps || (*fixes)[0].course_degrees ||
                 (*fixes)[0].hdop);
    EXPECT_EQ((*fixes)[1].latitude, 59.5);
    EXPECT_EQ((*fixes)[1].longitude, -180);
    EXPECT_EQ((*fixes)[1].altitude_m, 12.5);
    EXPECT_EQ((*fixes)[1].speed_mps, 23.5);
    EXPECT_EQ((*fixes)[1].course_degrees, 0);
    EXPECT_EQ((*fixes)[1].hdop, 0.9);
}

TEST(TrackFile, readsGPX10) {
    const auto fixes = fixesOfTrackFile(R"(<gpx version="1.0"><trk><trkseg><trkpt lat="1" lon="2">
        <time>2026-11-22T09:00:00Z</time><course>90</course><speed>5</speed></trkpt></trkseg></trk></gpx>)");
    ASSERT_EQ(reasonOf(fixes), "success");
    EXPECT_EQ(fixes->front().speed_mps, 5);
    EXPECT_EQ(fixes->front().course_degrees, 90);
}

TEST(TrackFile, refusesWhatIsNoTrack) {
    for (const char* const empty : {"", " \r\n\n"})
        EXPECT_EQ(reasonOf(fixesOfTrackFile(empty)), "empty, wanted GPX or NMEA sentences");
    EXPECT_EQ(reasonOf(fixesOfTrackFile("time,latitude\n1,2\n")), "line 1: no NMEA sentence and no GPX");
    EXPECT_EQ(reasonOf(fixesOfTrackFile("\n\nPK")), "line 3: no NMEA sentence and no GPX");
    EXPECT_EQ(reasonOf(fixesOfTrackFile("<?xml version='1.0'?>\n<kml/>")),
              "line 2: root element is kml, wanted gpx");
    EXPECT_EQ(reasonOf(fixesOfTrackFile("<gpx/>")), "no track points");
    EXPECT_EQ(reasonOf(fixesOfTrackFile("<gpx><trk><trkseg>\n<trkpt lat='1' lon='2'/></trkseg></trk></gpx>")),
              "line 2: none of 1 track points has a place and a time");
    EXPECT_EQ(reasonOf(fixesOfTrackFile("<gpx>\n <trk>\n</gpx>")).substr(0, 16), "line 3: no GPX: ");
    EXPECT_EQ(
        reasonOf(fixesOfTrackFile(nmea0183("GPGGA,123519,4807.038,N,01131.000,E,1,08,0.9,545.4,M,46.9,M,,"))),
        "no date, wanted RMC or ZDA sentences");
    EXPECT_EQ(reasonOf(fixesOfTrackFile(nmea0183("GPRMC,123520,V,,,,,,,230394,,,N"))),
              "no fix in 1 NMEA sentences");
}

std::string rmc(const char* clock, const char* date) {
    return nmea0183(std::string("GPRMC,") + clock + ",A,5920.0000,N,01803.0000,E,0.0,," + date + ",,,A");
}

std::string gga(const char* clock) {
    return nmea0183(std::string("GPGGA,") + clock + ",5920.0000,N,01803.0000,E,1,08,0.9,12.0,M,,M,,");
}

TEST(TrackFile, takesTheDatesOfSentencesAcrossMidnight) {
    // GGA comes before RMC in each second; the last second has GGA alone.
    const auto fixes =
        fixesOfTrackFile(gga("235958") + rmc("235958", "221126") + gga("235959") + rmc("235959", "221126") +
                         gga("000000") + rmc("000000", "231126") + gga("000001"));
    ASSERT_EQ(reasonOf(fixes), "success");
    ASSERT_EQ(fixes->size(), 4U);
    for (std::size_t i = 0; i < 4; ++i)
        EXPECT_EQ((*fixes)[i].time, day + 23h + 59min + 58s + seconds(i));
}

TEST(TrackFile, knowsTheDayBeforeTheFirstDate) {
    const auto fixes = fixesOfTrackFile(gga("235959") + "noise\n" + gga("000000") + rmc("000001", "231126"));
    ASSERT_EQ(reasonOf(fixes), "success");
    ASSERT_EQ(fixes->size(), 3U);
    EXPECT_EQ(fixes->front().time, day + 23h + 59min + 59s);
    EXPECT_EQ(fixes->back().time, day + 24h + 1s);
}

TEST(TrackFile, endsAtTheLimitsOfDates) {
    std::string text = rmc("000000", "010126");
    for (int i = 0; i < 200'000; ++i)
        text += gga(i % 3 == 0 ? "080000" : i % 3 == 1 ? "160000" : "000000");
    const auto fixes = fixesOfTrackFile(text);
    ASSERT_EQ(reasonOf(fixes), "success");
    EXPECT_LT(fixes->back().time, Time(sys_days(January / 3 / 2201)));
}

} // namespace
} // namespace velmora
