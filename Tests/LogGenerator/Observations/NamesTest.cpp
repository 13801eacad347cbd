// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/Catalogue.h"

#include <gtest/gtest.h>

#include <set>
#include <string>

namespace velmora {
namespace {

TEST(RoleTest, EveryRoleHasANameOfItsOwn) {
    std::set<std::string_view> names;
    auto next = static_cast<int>(Role::None);
    for (const RoleName& row : roleNames()) {
        EXPECT_EQ(static_cast<int>(row.role), ++next) << row.name;
        EXPECT_TRUE(names.insert(row.name).second) << row.name;
        EXPECT_EQ(nameOf(row.role), row.name);
        EXPECT_EQ(roleNamed(row.name), row.role);
    }
    EXPECT_EQ(next, static_cast<int>(Role::DataRate)); // the last of the enumeration
}

TEST(RoleTest, WhatIsNoRoleHasNone) {
    EXPECT_EQ(nameOf(Role::None), "");
    EXPECT_EQ(roleNamed(""), std::nullopt);
    EXPECT_EQ(roleNamed("serving.Level"), std::nullopt);
    EXPECT_EQ(nameOf(Role::ServingLevel), "serving.level");
    EXPECT_EQ(nameOf(Role::NeighbourPhysicalCell), "neighbour.physical-cell");
}

TEST(UnitTest, HasTheNameThatFollowsANumber) {
    EXPECT_EQ(nameOf(Unit::None), "");
    EXPECT_EQ(nameOf(Unit::DBm), "dBm");
    EXPECT_EQ(nameOf(Unit::DB), "dB");
    EXPECT_EQ(nameOf(Unit::Percent), "%");
    EXPECT_EQ(nameOf(Unit::KilobitPerSecond), "kbit/s");
    EXPECT_EQ(nameOf(Unit::Second), "s");
    EXPECT_EQ(nameOf(Unit::Megahertz), "MHz");
    EXPECT_EQ(nameOf(Unit::Byte), "byte");
    EXPECT_EQ(nameOf(Unit::Degree), "\u00B0");
    EXPECT_EQ(nameOf(Unit::Metre), "m");
}

struct SuffixCase {
    const char* name;
    const char* suffix;
    Unit unit;
    double scale;
};

class SuffixTest : public testing::TestWithParam<SuffixCase> {};

TEST_P(SuffixTest, HasItsUnit) {
    const std::optional<ShownUnit> shown = unitOfSuffix(GetParam().suffix);
    ASSERT_TRUE(shown);
    EXPECT_EQ(shown->unit, GetParam().unit);
    EXPECT_EQ(shown->scale, GetParam().scale);
}

constexpr SuffixCase suffixes[] = {
    {"None", "", Unit::None, 1},
    {"Level", " dBm", Unit::DBm, 1},
    {"Ratio", " dB", Unit::DB, 1},
    {"Share", "%", Unit::Percent, 1},
    {"Old", "% (old)", Unit::Percent, 1},
    {"Rate", " kbps", Unit::KilobitPerSecond, 1.024},
    {"Time", " sec", Unit::Second, 1},
    {"Pilot", " \u00D7 64chips", Unit::None, 1},
    {"PlainRate", " kbit/s", Unit::KilobitPerSecond, 1},
    {"Duration", " s", Unit::Second, 1},
    {"Frequency", " MHz", Unit::Megahertz, 1},
    {"Size", " bytes", Unit::Byte, 1},
    {"Angle", "\u00B0", Unit::Degree, 1},
    {"Length", " m", Unit::Metre, 1},
};
INSTANTIATE_TEST_SUITE_P(Suffixes, SuffixTest, testing::ValuesIn(suffixes),
                         [](const auto& tested) { return tested.param.name; });

TEST(UnitTest, AnotherSuffixHasNone) {
    EXPECT_FALSE(unitOfSuffix("dBm"));
    EXPECT_FALSE(unitOfSuffix(" dBm "));
    EXPECT_FALSE(unitOfSuffix(" GHz"));
}

TEST(IdentityTest, HasItsName) {
    EXPECT_EQ(nameOf(Identity::None), "");
    EXPECT_EQ(nameOf(Identity::Subscriber), "subscriber");
    EXPECT_EQ(nameOf(Identity::Equipment), "equipment");
    EXPECT_EQ(nameOf(Identity::Address), "address");
    EXPECT_EQ(nameOf(Identity::Location), "location");
}

TEST(ObservedKindTest, HasItsName) {
    EXPECT_EQ(nameOf(ObservedKind::Number), "number");
    EXPECT_EQ(nameOf(ObservedKind::Enumeration), "enumeration");
    EXPECT_EQ(nameOf(ObservedKind::Flag), "flag");
    EXPECT_EQ(nameOf(ObservedKind::Text), "text");
    EXPECT_EQ(nameOf(ObservedKind::Binary), "bytes");
    EXPECT_EQ(nameOf(ObservedKind::Absent), "absent");
}

} // namespace
} // namespace velmora
