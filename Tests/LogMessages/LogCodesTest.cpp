// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogCodes.h"

#include "Platform/TelephonyService.h"

#include <algorithm>
#include <cstdint>
#include <set>
#include <span>
#include <string_view>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::AllOf;
using testing::Ge;
using testing::IsEmpty;
using testing::Lt;
using testing::UnorderedElementsAre;

/// The technologies whose decoders want the code.
std::set<std::string_view> wanting(std::uint32_t code) {
    std::set<std::string_view> names;
    for (unsigned bit = 0; bit < technologyBits; ++bit)
        if (technologiesOfCode(code) >> bit & 1)
            names.insert(technologyOfBit(bit));
    return names;
}

TEST(LogCodesTest, belongToTheTechnologyOfTheirSections) {
    EXPECT_THAT(wanting(0x5137), UnorderedElementsAre("Ostrel_GSM"));
    EXPECT_THAT(wanting(0x4005), UnorderedElementsAre("Ostrel_GSM"));
    EXPECT_THAT(wanting(0x134F), UnorderedElementsAre("Ostrel_CDMA"));
    EXPECT_THAT(wanting(0xB0C1), UnorderedElementsAre("Ostrel_LTE"));
    EXPECT_THAT(wanting(0xB186), UnorderedElementsAre("Ostrel_LTE"));
    EXPECT_THAT(wanting(0xD00A), UnorderedElementsAre("Ostrel_UTRAN2"));
    EXPECT_THAT(wanting(0xD0E2), UnorderedElementsAre("Ostrel_UTRAN2"));
}

TEST(LogCodesTest, belongToAllTechnologiesWithSectionsInTheExtraStream) {
    for (const std::uint32_t code : {0xFF0000u, 0xFF0001u, 0xFF0002u})
        EXPECT_THAT(wanting(code),
                    UnorderedElementsAre("Ostrel_GSM", "Ostrel_LTE", "Ostrel_UTRAN2", "Modem"));
    for (std::uint32_t code = 0xFF0003; code <= 0xFF0007; ++code)
        EXPECT_THAT(wanting(code), UnorderedElementsAre("Modem"));
}

TEST(LogCodesTest, belongToNoneWhereNoDecoderWantsThem) {
    EXPECT_THAT(wanting(0x108A), UnorderedElementsAre("Ostrel_CDMA")); // the lowest code
    for (const std::uint32_t code :
         {0u, 1u, 0x1089u, 0x108Bu, 0x1375u, 0xFFFFu, 0x10000u, 0x1005137u, 0xFF0008u})
        EXPECT_THAT(wanting(code), IsEmpty()) << code;
}

TEST(LogCodesTest, areListedOnceInAscendingOrder) {
    const std::span<const LogCodeRow> rows = logCodeRows();
    const auto notAbove = [](const LogCodeRow& a, const LogCodeRow& b) { return a.code >= b.code; };
    EXPECT_EQ(std::ranges::adjacent_find(rows, notAbove), rows.end());
    for (const LogCodeRow& row : rows)
        EXPECT_THAT(row.technologies, AllOf(Ge(1), Lt(1 << technologyBits))) << row.code;
}

TEST(LogCodesTest, knowEveryBinaryTechnology) {
    std::set<std::string_view> names{"IFX"};
    for (unsigned bit = 0; bit < technologyBits; ++bit)
        EXPECT_TRUE(names.insert(technologyOfBit(bit)).second);
    std::set<std::string_view> all;
    for (const std::string_view technology : voxTechnologies)
        all.insert(shortTechnologyName(technology));
    EXPECT_EQ(names, all);
}

} // namespace
} // namespace velmora
