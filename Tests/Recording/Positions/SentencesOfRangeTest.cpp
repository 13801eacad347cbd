// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Positions/SentencesOfRange.h"

#include "Tests/Support/NMEA.h"

#include <chrono>
#include <cstdio>
#include <optional>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

/// Keeps what lies from 10 s to before 12 s. A sentence's block is the tenth of a second in which it came.
class SentencesOfRangeTest : public testing::Test {
protected:
    /// A GGA or RMC sentence that came then, of a fix of that second or of another.
    void add(std::chrono::milliseconds arrival, const char* kind = "GGA", bool isValid = true,
             std::optional<int> fixSecond = {}) {
        char text[128];
        const int second = fixSecond.value_or(static_cast<int>(arrival / 1s));
        if (std::string(kind) == "GGA")
            std::snprintf(text, sizeof text, "GPGGA,1200%02d,5900.0000,N,01800.0000,E,%d,08,0.9,12.0,M,,M,,",
                          second, isValid ? 1 : 0);
        else
            std::snprintf(text, sizeof text, "GPRMC,1200%02d,%c,5900.0000,N,01800.0000,E,,,221126,,", second,
                          isValid ? 'A' : 'V');
        _range.add({Time(arrival), nmea0183(text)}, {static_cast<std::uint8_t>(arrival / 100ms)});
    }

    std::vector<int> _kept;
    SentencesOfRange _range{[](Time time) {
                                if (time < Time(10s))
                                    return RangeSide::Before;
                                return time < Time(12s) ? RangeSide::Within : RangeSide::After;
                            },
                            [this](const SentencesOfRange::Block& block) { _kept.push_back(block.front()); }};
};

TEST_F(SentencesOfRangeTest, keepsOneFixBeforeAndOneAfter) {
    for (const auto second : {7s, 8s, 9s, 10s, 11s, 12s, 13s, 14s}) {
        add(second);
        add(second + 100ms, "RMC");
    }
    _range.endSection();
    EXPECT_THAT(_kept, ElementsAre(90, 91, 100, 101, 110, 111, 120, 121));
}

TEST_F(SentencesOfRangeTest, keepsThemAroundMessagesWithoutAFixBetween) {
    add(8500ms);
    add(9500ms);
    _range.addMessage();
    EXPECT_THAT(_kept, ElementsAre(95));
    add(12s);
    add(13s);
    EXPECT_THAT(_kept, ElementsAre(95, 120));
}

TEST_F(SentencesOfRangeTest, keepsNothingWhereNothingIsWithin) {
    for (const auto second : {8s, 9s, 12s, 13s})
        add(second);
    _range.endSection();
    EXPECT_THAT(_kept, IsEmpty());
}

TEST_F(SentencesOfRangeTest, sentencesWithoutAFixAreNoFix) {
    add(7s);
    add(8s, "GGA", false);
    add(9s, "RMC", false);
    _range.addMessage();
    add(12s, "GGA", false);
    add(13s);
    add(13100ms, "RMC", false); // which makes it no fix
    add(14s);
    add(15s);
    EXPECT_THAT(_kept, ElementsAre(70, 90, 140));
}

TEST_F(SentencesOfRangeTest, keepsTheSentencesOfOneFixTogether) {
    add(8900ms);
    add(9900ms);
    _range.addMessage();
    add(10100ms, "RMC", true, 9);
    add(11900ms);
    add(12000ms, "RMC", true, 11);
    add(13s);
    _range.endSection();
    EXPECT_THAT(_kept, ElementsAre(99, 101, 119, 120, 130));
}

TEST_F(SentencesOfRangeTest, keepsAStatementThatTheLastFixIsNone) {
    const std::string late = nmea0183("GPRMC,120011,V,5900.0000,N,01800.0000,E,,,221126,,");
    SentencesOfRange range(
        [](Time time) { return time < Time(11500ms) ? RangeSide::Within : RangeSide::After; },
        [this](const SentencesOfRange::Block& block) { _kept.push_back(block.front()); });
    range.add({Time(11s), nmea0183("GPGGA,120011,5900.0000,N,01800.0000,E,1,08,0.9,12.0,M,,M,,")}, {1});
    range.add({Time(11600ms), late}, {2});
    range.endSection();
    EXPECT_THAT(_kept, ElementsAre(1, 2));
}

TEST_F(SentencesOfRangeTest, aFixBeforeIsOfTheSameSection) {
    add(9s);
    _range.endSection();
    _range.addMessage();
    EXPECT_THAT(_kept, IsEmpty());
}

} // namespace
} // namespace velmora
