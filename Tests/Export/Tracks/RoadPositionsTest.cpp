// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Tracks/Geodesy.h"
#include "Analysis/Tracks/Track.h"
#include "Recording/Positions/FixAssembler.h"
#include "Recording/Positions/NMEAWriter.h"
#include "Telephony/Drives/DriveScenario.h"
#include "Telephony/Drives/Road/RoadReceiver.h"
#include "Telephony/Drives/ScenarioRegistry.h"

#include <algorithm>
#include <chrono>
#include <cmath>
#include <memory>
#include <numbers>
#include <vector>

#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;

// The ring road of the drives: an ellipse with these half axes.
constexpr double length_m = 1800;
constexpr double width_m = 1100;

/// The track that the fixes give after they have been written as sentences and read again.
Track trackThroughSentences(const std::vector<Fix>& fixes) {
    FixAssembler assembler;
    std::vector<Fix> read;
    for (const Fix& fix : fixes)
        for (const std::string& sentence : nmeaSentences(fix))
            if (const auto complete = assembler.add({fix.time, sentence}))
                read.push_back(*complete);
    if (const auto last = assembler.finish())
        read.push_back(*last);
    return Track::ofFixes(read);
}

Coordinates placeAt(double east_m, double north_m) {
    return {latitudeOf(north_m), longitudeOf(east_m)};
}

/// From the nearest of the road's points, a centimetre apart near the least.
double distanceFromRoad_m(const Fix& fix) {
    const double east_m = fix.longitude * metresInDegree;
    const double north_m = (fix.latitude - ringCentreLatitude) * metresInDegree;
    double best = std::atan2(north_m / width_m, east_m / length_m);
    const auto distance = [&](double angle) {
        return std::hypot(east_m - length_m * std::cos(angle), north_m - width_m * std::sin(angle));
    };
    for (double step = 0.01; step > 1e-7; step /= 2)
        for (const double angle : {best - step, best + step})
            if (distance(angle) < distance(best))
                best = angle;
    return distance(best);
}

TEST(RoadPositions, areWithinAMetreAt23MetresASecond) {
    // Round the ring at constant speed, in steps of a millisecond.
    constexpr double speed_mps = 23;
    double angle = 0;
    std::vector<Coordinates> places;
    std::vector<Fix> fixes;
    for (int millisecond = 0; millisecond < 410'000; ++millisecond) {
        const double east_m = length_m * std::cos(angle);
        const double north_m = width_m * std::sin(angle);
        places.push_back(placeAt(east_m, north_m));
        if (millisecond % 1000 == 0) {
            Fix& fix = fixes.emplace_back();
            fix.time = Time(std::chrono::milliseconds(millisecond));
            fix.latitude = places.back().latitude;
            fix.longitude = places.back().longitude;
        }
        angle += speed_mps / 1000 / std::hypot(length_m * std::sin(angle), width_m * std::cos(angle));
    }
    ASSERT_GT(angle, 2 * std::numbers::pi); // all round
    const Track track = trackThroughSentences(fixes);
    ASSERT_EQ(track.fixes().size(), 410U);
    double largest = 0;
    for (int millisecond = 0; millisecond <= 409'000; ++millisecond) {
        const auto position = track.at(Time(std::chrono::milliseconds(millisecond)));
        ASSERT_TRUE(position) << millisecond;
        largest = std::max(largest, distance_m(Coordinates{position->fix.latitude, position->fix.longitude},
                                               places[static_cast<std::size_t>(millisecond)]));
    }
    EXPECT_LT(largest, 1);
    RecordProperty("largest", std::to_string(largest));
}

TEST(RoadPositions, ofEveryDriveAreOnItsRoad) {
    constexpr std::chrono::seconds end{300};
    for (const ScenarioKind& kind : scenarioKinds()) {
        const std::unique_ptr<Scenario> scenario = kind.make(7);
        RoadReceiver receiver(DriveScenario::startTime());
        std::vector<Fix> fixes;
        std::vector<std::chrono::nanoseconds> messages;
        while (messages.empty() || messages.back() < end) {
            messages.push_back(scenario->next().offset);
            EXPECT_GE(messages.back(), scenario->place().offset) << kind.name;
            for (const Fix& fix : receiver.drivenTo(scenario->place()))
                fixes.push_back(fix);
        }
        EXPECT_GE(fixes.size(), 299U) << kind.name;
        const Track track = trackThroughSentences(fixes);
        std::size_t positions = 0;
        double fastest_mps = 0;
        for (const std::chrono::nanoseconds offset : messages) {
            const auto position = track.at(DriveScenario::startTime() + offset);
            if (!position)
                continue; // after the last fix
            ++positions;
            EXPECT_LT(distanceFromRoad_m(position->fix), 1) << kind.name << " at " << offset.count();
            fastest_mps = std::max(fastest_mps, position->fix.speed_mps.value());
        }
        EXPECT_GT(positions * 100, messages.size() * 98) << kind.name;
        EXPECT_GT(fastest_mps, 13) << kind.name;
        EXPECT_LT(fastest_mps, 23.1) << kind.name;
        EXPECT_GT(track.length_m(), 1000) << kind.name;
    }
}

} // namespace
} // namespace velmora
