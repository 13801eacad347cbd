// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Screen/LevelStrip.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

using Levels = std::vector<std::optional<double>>;

TEST(LevelStripTest, BrailleHasTwoLevelsAColumnOfFourDots) {
    // Quarters of -120 to -80 dBm: -120 is in the first, -110 in the second, -100 in the third, -80 in the
    // last.
    const Levels levels = {-120, -110, -100, -80, std::nullopt, -80, std::nullopt, std::nullopt};
    // Dots 7, 8 6 | 7 3 2, 8 6 5 4 | 8 6 5 4 | nothing, as Unicode's chapter 21.1 numbers them.
    EXPECT_EQ(levelRow(levels, 4, Characters::Unicode), "\u28E0\u28FE\u28B8 ");
}

TEST(LevelStripTest, ASCIIHasARampOfSeven) {
    const Levels levels = {-120, -120, -80, -80, -100, std::nullopt, std::nullopt, std::nullopt};
    // -100 is half-way: the fourth of seven.
    EXPECT_EQ(levelRow(levels, 4, Characters::ASCII), ".#= ");
}

TEST(LevelStripTest, OneLevelIsFullAndNoneIsBlank) {
    EXPECT_EQ(levelRow({-90, -90}, 1, Characters::Unicode), "\u28FF");
    EXPECT_EQ(levelRow({std::nullopt, std::nullopt}, 1, Characters::Unicode), " ");
    EXPECT_EQ(levelRow({}, 3, Characters::ASCII), "   ");
}

TEST(LevelStripTest, TheSecondLineHasPlaceEventsAndRange) {
    BrowseView view;
    view.levels = {-120, -80};
    view.levels.resize(80);
    view.place01 = 0;
    view.eventPlaces = {0.25, 1};
    const std::vector<StyledLine> lines = stripLines(view, 40, Characters::ASCII);
    ASSERT_EQ(lines.size(), 2U);
    EXPECT_EQ(plainText(lines[1]), "^         !              -120 to -80 dBm");
}

} // namespace
} // namespace velmora
