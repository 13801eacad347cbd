// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Tracks/PositionedReader.h"

#include "Export/Tracks/TrackCollector.h"
#include "Tests/Support/NMEA.h"

#include <chrono>
#include <cmath>
#include <cstdio>
#include <memory>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;

/// Messages and sentences of a script.
class ScriptedReader final : public MessageReader {
public:
    struct Entry {
        std::chrono::milliseconds time;
        std::string sentence; ///< empty for a message
    };

    explicit ScriptedReader(std::vector<Entry> entries) : _entries(std::move(entries)) {}

    std::optional<LoggedMessage> next() override {
        while (_at < _entries.size()) {
            const Entry& entry = _entries[_at++];
            if (!entry.sentence.empty()) {
                if (_sentences)
                    _sentences({Time(entry.time), nmea0183(entry.sentence), _at});
                continue;
            }
            LoggedMessage message;
            message.time = Time(entry.time);
            message.number = _at;
            return message;
        }
        return std::nullopt;
    }
    void setSentences(PositionSentences sentences) override { _sentences = std::move(sentences); }
    const std::string& technology() const override { return _technology; }
    const std::optional<Failure>& failure() const override { return _failure; }
    std::size_t read() const { return _at; }
    void lose(Loss loss) { addLoss(std::move(loss)); }

private:
    std::vector<Entry> _entries;
    std::size_t _at = 0;
    PositionSentences _sentences;
    std::string _technology = "Modem";
    std::optional<Failure> _failure;
};

/// A fix on the meridian of 18 degrees that many 1/10000 of a minute north of 59 degrees: 0.185 m each.
ScriptedReader::Entry fix(std::chrono::milliseconds time, int offset, const char* kind = "RMC") {
    char text[128];
    const auto seconds = static_cast<int>(time / 1s);
    std::snprintf(text, sizeof text, "GP%s,1200%02d.%03d,A,5900.%04d,N,01800.0000,E,,,221126,,", kind,
                  seconds % 60, static_cast<int>(time % 1s / 1ms), offset);
    return {time, text};
}

/// "number: offset", or "number: none".
std::vector<std::string> positionsOf(std::vector<ScriptedReader::Entry> entries,
                                     std::chrono::nanoseconds gap = Track::defaultGap) {
    ScriptedReader scripted(std::move(entries));
    PositionedReader reader(scripted, gap);
    std::vector<std::string> positions;
    while (const auto message = reader.next()) {
        std::string text = "none";
        if (const auto& position = reader.position())
            text = std::to_string(std::lround((position->fix.latitude - 59) * 600'000));
        positions.push_back(std::to_string(message->number) + ": " + text);
    }
    EXPECT_FALSE(reader.position());
    return positions;
}

TEST(PositionedReader, interpolatesBetweenTheFixesAroundAMessage) {
    EXPECT_THAT(positionsOf({{500ms, ""},
                             fix(1000ms, 0),
                             {1000ms, ""},
                             {1250ms, ""},
                             {1900ms, ""},
                             fix(2000ms, 100),
                             {2000ms, ""},
                             {2500ms, ""},
                             fix(3000ms, 300),
                             {3500ms, ""}}),
                ElementsAre("1: none", "3: 0", "4: 25", "5: 90", "7: 100", "8: 200", "10: none"));
}

TEST(PositionedReader, hasNoPositionInAGap) {
    EXPECT_THAT(positionsOf({fix(1000ms, 0),
                             {1500ms, ""},
                             {3000ms, ""},
                             fix(3500ms, 250),
                             {3600ms, ""},
                             fix(4000ms, 300),
                             {7000ms, ""}}),
                ElementsAre("2: none", "3: none", "5: 260", "7: none"));
    EXPECT_THAT(positionsOf({fix(1000ms, 0), {1500ms, ""}, {3000ms, ""}, fix(3500ms, 250)}, 3s),
                ElementsAre("2: 50", "3: 200"));
}

TEST(PositionedReader, doesNotWaitWithoutPositions) {
    ScriptedReader scripted({{0ms, ""}, {1ms, ""}, {2ms, ""}});
    PositionedReader reader(scripted);
    EXPECT_TRUE(reader.next());
    EXPECT_EQ(scripted.read(), 1U);
}

TEST(PositionedReader, readsNoFurtherThanAPositionNeeds) {
    std::vector<ScriptedReader::Entry> entries = {fix(0ms, 0)};
    constexpr std::chrono::milliseconds end{100'000};
    for (std::chrono::milliseconds time{0}; time < end; time += 10ms)
        entries.push_back({time + 5ms, ""});
    ScriptedReader scripted(entries);
    PositionedReader reader(scripted);
    EXPECT_TRUE(reader.next());
    // 2 s of gap and 0.9 s until a fix is complete, 100 messages a second.
    EXPECT_LE(scripted.read(), 295U);
    while (reader.next()) {
        EXPECT_FALSE(reader.position());
    }
}

TEST(PositionedReader, startsAnewWhenTheClockWasSetBack) {
    EXPECT_THAT(positionsOf({fix(50'000ms, 0),
                             {50'500ms, ""},
                             fix(51'000ms, 100),
                             {10'000ms, ""},
                             fix(10'000ms, 500),
                             {10'500ms, ""},
                             fix(11'000ms, 600),
                             {11'000ms, ""}}),
                ElementsAre("2: 50", "4: none", "6: 550", "8: 600"));
}

TEST(PositionedReader, passesLossesAndFixesOn) {
    ScriptedReader scripted({fix(0ms, 0), {0ms, ""}, fix(1000ms, 10)});
    for (std::uint64_t i = 0; i < 150; ++i)
        scripted.lose({i, 2, i, "damaged", false});
    PositionedReader reader(scripted);
    std::vector<Time> fixes;
    reader.setFixes([&](const Fix& each) { fixes.push_back(each.time); });
    while (reader.next()) {
    }
    EXPECT_EQ(reader.lossTotals().losses, 150U);
    EXPECT_EQ(reader.lossTotals().bytes, 300U);
    EXPECT_EQ(reader.losses().size(), 100U);
    EXPECT_THAT(fixes, ElementsAre(Time(0ms), Time(1000ms)));
}

TEST(TrackCollector, hasTheWholeTrack) {
    ScriptedReader scripted({fix(0ms, 0), {500ms, ""}, fix(1000ms, 10), {1500ms, ""}});
    TrackCollector collector(scripted);
    while (scripted.next()) {
    }
    const Track track = collector.takeTrack();
    EXPECT_EQ(track.fixes().size(), 2U);
    EXPECT_TRUE(track.at(Time(500ms)));
}

} // namespace
} // namespace velmora
