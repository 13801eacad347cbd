// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/UTRAN/UTRANScenario.h"

#include "Platform/TelephonyService.h"
#include "Tests/Telephony/Drives/Displays/DisplayTesting.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>
#include <set>

/// The UTRAN scenario through the technology's decoder, with the template that is shipped.

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::MatchesRegex;

class UTRANDisplayTest : public DisplayTest {
protected:
    UTRANDisplayTest() : DisplayTest(kVoxLogChannelTechnology_Ostrel_UTRAN2, "Ostrel_UTRAN") {}
};

TEST_F(UTRANDisplayTest, everySectionThatCanBeFilledIs) {
    std::set<std::string> rrc;
    std::set<std::string> access;
    std::map<std::string, std::set<std::size_t>> sizes;
    std::set<std::string> status;
    play<UTRANScenario>(1, 4min, [&] {
        rrc.insert(text(node("Serving Cell", "RRC Info"), "State"));
        access.insert(text(node("Serving Cell", "Serving Cell Info"), "Allowed Access"));
        sizes["UTRAN"].insert(node("Neighbors", "Neighbor Cell List").asArray()->size());
        sizes["GSM"].insert(node("Neighbors", "GSM Neighbor Cell List").asArray()->size());
        sizes["BLER"].insert(node("Channel Quality", "TRCH BLER").asArray()->size());
        sizes["SIR"].insert(node("Channel Quality", "CCTRCH SIR").asArray()->size());
        sizes["PDP"].insert(node("PDP Context Info").asArray()->size());
        for (const Value& row : *node("Neighbors", "Neighbor Cell List").asArray())
            status.insert(text(row, "Status"));
    });
    rrc.erase("(none)"); // before the first report
    // The last one is shown after a record of the RRC state that came too short.
    EXPECT_EQ(rrc, (std::set<std::string>{"Disconnected", "Connecting", "Cell Fach", "Cell DCH", "Cell PCH",
                                          "Cell URA PCH", "Unknown RRC Mode"}));
    EXPECT_EQ(access, (std::set<std::string>{"(none)", "All Calls", "Emergency Calls Only"}));
    EXPECT_EQ(sizes["GSM"], (std::set<std::size_t>{0})) << "this list is never shown";
    EXPECT_GE(*sizes["UTRAN"].rbegin(), 6u);
    EXPECT_THAT(sizes["BLER"], ::testing::IsSupersetOf<std::size_t>({0, 1, 2, 4}));
    EXPECT_THAT(sizes["SIR"], ::testing::IsSupersetOf<std::size_t>({0, 1, 2}));
    EXPECT_EQ(sizes["PDP"], (std::set<std::size_t>{0, 1, 2}));
    EXPECT_THAT(status, ::testing::IsSupersetOf<std::string>({"ASET", "MSET", "DSET"}));
    EXPECT_EQ(node("SIM Info").asDictionary()->size(), 14u);

    const std::vector<std::string> labels = {
        "Cell Access Restrictions", "Cell ID",         "Downlink UARFCN",     "Uplink UARFCN",       "URA ID",
        "Allowed Access",           "Local Area Code", "Freq Band Indicator", "Cell Scrambling Code"};
    for (const std::string& label : labels)
        EXPECT_NE(text(node("Serving Cell", "Serving Cell Info"), label), "(none)") << label;
}

TEST_F(UTRANDisplayTest, shownValuesArePlausible) {
    play<UTRANScenario>(2, 4min, [&] {
        for (const Value& row : *node("Neighbors", "Neighbor Cell List").asArray()) {
            EXPECT_THAT(text(row, "UARFCN"), MatchesRegex("10[01][0-9][0-9]"));
            EXPECT_LE(std::stoi(text(row, "Cell ID")), 127);
            EXPECT_THAT(text(row, "Filter RSCP"), MatchesRegex("0\\.[0-3][0-9]{5}")); // 91/256 at most
        }
        for (const Value& row : *node("Channel Quality", "TRCH BLER").asArray())
            EXPECT_LE(std::stoi(text(row, "TRCH BLER Measurement")), 63);
        for (const Value& row : *node("Channel Quality", "CCTRCH SIR").asArray()) {
            const Array* ratios = (*row.asDictionary())["SIR"].asArray();
            ASSERT_TRUE(ratios);
            ASSERT_EQ(ratios->size(), 6u);
            for (const Value& ratio : *ratios)
                EXPECT_LE(std::stoi(*ratio.asString()), 63);
        }
    });
}

TEST_F(UTRANDisplayTest, onlyTheUnusualMessagesAreReported) {
    play<UTRANScenario>(3, 20min, [] {});
    int wrongType = 0;
    std::map<std::string, int> overruns;
    for (const std::string& line : errors) {
        if (line == "Invalid log type: 2. Dropping.")
            ++wrongType;
        else if (line.starts_with("Record 0x"))
            ++overruns[line.substr(7, 6)];
        else
            ADD_FAILURE() << line;
    }
    EXPECT_GE(wrongType, 5);
    EXPECT_GE(overruns["0xD00A"], 1);
    EXPECT_GE(overruns["0xD00C"], 2) << "both lists of it";
    EXPECT_GE(overruns["0xD00E"], 1);
}

} // namespace
} // namespace velmora
