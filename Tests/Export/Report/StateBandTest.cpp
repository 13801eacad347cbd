// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/StateBand.h"

#include <gtest/gtest.h>

namespace velmora {

namespace {

using namespace std::chrono_literals;

Time at(std::chrono::nanoseconds time) {
    return Time(time);
}

std::vector<std::string> shown(const StateBand& band) {
    std::vector<std::string> texts;
    for (const StateBand::Step& each : band.steps())
        texts.push_back(std::to_string(each.since.time_since_epoch() / 1s) + ' ' + band.values()[each.value]);
    return texts;
}

TEST(StateBand, HasAStepForEachChange) {
    StateBand band("mode");
    band.end(at(0s)); // nothing has begun
    band.set(at(1s), "idle");
    band.set(at(2s), "idle");
    band.set(at(3s), "connected");
    band.end(at(4s));
    band.end(at(5s));
    band.set(at(6s), "idle");
    EXPECT_EQ(shown(band), (std::vector<std::string>{"1 idle", "3 connected", "4 ", "6 idle"}));
}

TEST(StateBand, JoinsTheShortestStatesOfVeryMany) {
    StateBand band("cell", 16);
    band.set(at(0s), "long");
    for (int i = 0; i < 200; ++i)
        band.set(at(100s + i * 10ms), i % 2 == 0 ? "a" : "b");
    band.set(at(200s), "last");
    EXPECT_LE(band.steps().size(), 17U);
    EXPECT_EQ(shown(band).front(), "0 long");
    EXPECT_EQ(shown(band)[1], "100 several");
    EXPECT_EQ(shown(band)[band.steps().size() - 2], "101 b"); // the last of them lasts
    EXPECT_EQ(shown(band).back(), "200 last");
}

TEST(StateBand, CallsValuesBeyondTheMostSeveral) {
    StateBand band("cell");
    for (std::size_t i = 0; i < 2 * StateBand::mostValues; ++i)
        band.set(at(i * 1s), std::to_string(i));
    EXPECT_EQ(band.values().size(), StateBand::mostValues);
    EXPECT_EQ(shown(band).back(), "1022 several"); // the first two are unknown and several
}

TEST(StateBand, CallsAValueByItsLaterName) {
    StateBand band("cell");
    band.set(at(0s), "1");
    band.rename("1", "PCI 62 on EARFCN 6300");
    band.rename("2", "never seen");
    EXPECT_EQ(shown(band), std::vector<std::string>{"0 PCI 62 on EARFCN 6300"});
}

} // namespace

} // namespace velmora
