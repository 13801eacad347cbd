// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/DriveIdentities.h"
#include "Telephony/Drives/ScenarioRegistry.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <set>
#include <string>

namespace velmora {
namespace {

using testing::MatchesRegex;

bool has(const std::string& bytes, const std::string& text) {
    return bytes.find(text) != std::string::npos;
}

/// All bytes of a drive's first messages.
std::string bytesOf(Scenario& scenario) {
    constexpr int messages = 4000;
    std::string all;
    for (int i = 0; i < messages; ++i) {
        const ScenarioEvent event = scenario.next();
        all.append(event.message.bytes().begin(), event.message.bytes().end());
    }
    return all;
}

class PlantedIdentities : public testing::TestWithParam<const char*> {
protected:
    static constexpr std::uint64_t seed = 7;
    const DriveIdentities identities = DriveIdentities::random(seed);
    [[nodiscard]] static std::unique_ptr<Scenario> drive() {
        return scenarioKindNamed(GetParam())->make(seed);
    }
};

INSTANTIATE_TEST_SUITE_P(Scenarios, PlantedIdentities,
                         testing::Values("gsm", "lte", "utran", "ifx", "modem"));

TEST_P(PlantedIdentities, AreThoseOfTheDrive) {
    const auto scenario = drive();
    scenario->setIdentities(identities);
    const std::string bytes = bytesOf(*scenario);
    const std::string name = GetParam();
    EXPECT_TRUE(has(bytes, identities.sims[0].iccid)) << identities.sims[0].iccid;
    EXPECT_TRUE(has(bytes, identities.addresses)) << identities.addresses;
    // A phone of GSM has one context, of the other version.
    EXPECT_EQ(has(bytes, identities.addresses6), std::string(GetParam()) != "gsm");
    if (name == "modem") {
        for (const std::string& text :
             {identities.sims[1].iccid, identities.sims[0].imsi, identities.sims[1].imsi, identities.eid,
              identities.equipment, withoutSpaces(identities.sims[0].number),
              withoutSpaces(identities.sims[1].number), identities.bearerAddresses,
              identities.bearerAddresses6})
            EXPECT_TRUE(has(bytes, text)) << text;
    } else if (name != "ifx") {
        EXPECT_TRUE(has(bytes, identities.sims[0].number)) << identities.sims[0].number;
        EXPECT_TRUE(has(bytes, identities.mailbox)) << identities.mailbox;
    }
    for (const std::string& text : DriveIdentities().texts())
        EXPECT_FALSE(has(bytes, text)) << text;
}

TEST_P(PlantedIdentities, AreThoseOfATestNetworkByDefault) {
    const std::string bytes = bytesOf(*drive());
    EXPECT_TRUE(has(bytes, "8900101000000000017")) << "8900101000000000017";
    for (const std::string& text : identities.texts())
        EXPECT_FALSE(has(bytes, text)) << text;
}

TEST(DriveIdentitiesTest, OtherSeedsHaveOtherOnes) {
    std::set<std::string> all;
    std::size_t count = 0;
    for (std::uint64_t seed = 0; seed < 200; ++seed)
        for (const std::string& text : DriveIdentities::random(seed).texts()) {
            // 24 000 prefixes of IPv4 addresses are not enough for none to come twice.
            if (text.starts_with("10."))
                continue;
            all.insert(text);
            ++count;
        }
    EXPECT_EQ(all.size(), count);
    EXPECT_EQ(DriveIdentities::random(7).texts(), DriveIdentities::random(7).texts());
}

TEST(DriveIdentitiesTest, HaveTheFormOfRealOnes) {
    const DriveIdentities identities = DriveIdentities::random(7);
    EXPECT_THAT(identities.sims[0].iccid, MatchesRegex("8949[0-9]{15}"));
    EXPECT_THAT(identities.sims[0].imsi, MatchesRegex("00101[0-9]{10}"));
    EXPECT_THAT(identities.sims[0].number, MatchesRegex("\\+49 15[0-9] [0-9]{4} [0-9]{4}"));
    EXPECT_THAT(identities.eid, MatchesRegex("89049032[0-9]{24}"));
    EXPECT_THAT(identities.equipment, MatchesRegex("35[0-9]{13}"));
    EXPECT_THAT(identities.addresses, MatchesRegex("10\\.[0-9]{3}\\.[0-9]{3}\\."));
    EXPECT_THAT(identities.bearerAddresses6, MatchesRegex("2a00(:[1-9a-f][0-9a-f]{3}){3}::"));
}

} // namespace
} // namespace velmora
