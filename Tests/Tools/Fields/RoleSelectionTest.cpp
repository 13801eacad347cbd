// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Fields/RoleSelection.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

TEST(RoleSelectionTest, DefaultIsEveryLeaf) {
    const RoleSelection all;
    EXPECT_TRUE(all.isEverything());
    EXPECT_TRUE(all.contains(Role::None));
    EXPECT_TRUE(all.contains(Role::RadioState));
}

TEST(RoleSelectionTest, NameSelectsOneRole) {
    const Result<RoleSelection> level = RoleSelection::named("serving.level");
    ASSERT_TRUE(level);
    EXPECT_FALSE(level->isEverything());
    EXPECT_TRUE(level->contains(Role::ServingLevel));
    EXPECT_FALSE(level->contains(Role::ServingQuality));
    EXPECT_FALSE(level->contains(Role::NeighbourLevel));
    EXPECT_FALSE(level->contains(Role::None));
}

TEST(RoleSelectionTest, PartBeforeTheDotSelectsAllThatHaveIt) {
    const Result<RoleSelection> serving = RoleSelection::named("serving");
    ASSERT_TRUE(serving);
    EXPECT_TRUE(serving->contains(Role::ServingLevel));
    EXPECT_TRUE(serving->contains(Role::ServingCountryCode));
    EXPECT_FALSE(serving->contains(Role::NeighbourLevel));
    EXPECT_FALSE(serving->contains(Role::None));
}

TEST(RoleSelectionTest, NameWithoutADotIsARole) {
    const Result<RoleSelection> rate = RoleSelection::named("data-rate");
    ASSERT_TRUE(rate);
    EXPECT_TRUE(rate->contains(Role::DataRate));
}

TEST(RoleSelectionTest, OtherTextsListTheNames) {
    for (const char* const wrong : {"", ".", "serv", "serving.", "serving.lev", "level", "data", "Serving"}) {
        const Result<RoleSelection> roles = RoleSelection::named(wrong);
        ASSERT_FALSE(roles) << wrong;
        EXPECT_EQ(
            roles.reason(),
            "got " + std::string(wrong) +
                ", wanted one of serving.mcc, serving.mnc, serving.area, serving.cell, serving.channel, "
                "serving.physical-cell, serving.level, serving.quality, neighbour.channel, "
                "neighbour.physical-cell, neighbour.level, neighbour.quality, registration.state, "
                "radio.state, block-error-rate, data-rate, or the part before a dot");
    }
}

} // namespace
} // namespace velmora
