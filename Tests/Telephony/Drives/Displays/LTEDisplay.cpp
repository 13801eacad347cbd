// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/LTE/LTEScenario.h"

#include "Platform/TelephonyService.h"
#include "Tests/Telephony/Drives/Displays/DisplayTesting.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>
#include <set>

/// The LTE scenario through the technology's decoder, with the template that is shipped.

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::IsSupersetOf;

class LTEDisplayTest : public DisplayTest {
protected:
    LTEDisplayTest() : DisplayTest(kVoxLogChannelTechnology_Ostrel_LTE, "LTE") {}
};

TEST_F(LTEDisplayTest, everySectionIsFilled) {
    std::set<std::string> bandwidths;
    std::set<std::string> types;
    std::map<std::string, std::size_t> most;
    std::map<std::string, std::size_t> labels;
    const std::pair<const char*, const char*> dictionaries[] = {
        {"Serving Cell", "Serving Cell Info"},
        {"Serving Cell", "Serving Cell Measurements"},
        {"Idle Mode Neighbors", "Neighbor Measurements"},
        {"Reselection", "Reselection Candidates"},
        {"Connected Mode", "Connected mode LTE Intra-frequency Measurement"},
    };
    const std::pair<const char*, const char*> lists[] = {
        {"Idle Mode Neighbors", "Neighbor Cells List"},
        {"Reselection", "Reselection Candidates List"},
        {"Connected Mode", "Measured Neighbor Cells"},
        {"Connected Mode", "Detected Cells"},
        {"Packet Data", "PDP Context Info"},
    };
    play<LTEScenario>(1, 4min, [&] {
        for (const auto& [group, section] : dictionaries)
            labels[section] = std::max(labels[section], node(group, section).asDictionary()->size());
        for (const auto& [group, section] : lists)
            most[section] = std::max(most[section], node(group, section).asArray()->size());
        bandwidths.insert(text(node("Serving Cell", "Serving Cell Info"), "Download Bandwidth"));
        for (const Value& row : *node("Reselection", "Reselection Candidates List").asArray())
            types.insert(text(row, "Candidate RAT Type"));
    });
    EXPECT_EQ(labels, (std::map<std::string, std::size_t>{
                          {"Serving Cell Info", 10}, // "UARFCN" among them, while it is there
                          {"Serving Cell Measurements", 18},
                          {"Neighbor Measurements", 3},
                          {"Reselection Candidates", 3},
                          {"Connected mode LTE Intra-frequency Measurement", 5}}));
    EXPECT_EQ(most, (std::map<std::string, std::size_t>{{"Neighbor Cells List", 6},
                                                        {"Reselection Candidates List", 3},
                                                        {"Measured Neighbor Cells", 6},
                                                        {"Detected Cells", 3},
                                                        {"PDP Context Info", 2}}));
    EXPECT_THAT(bandwidths,
                IsSupersetOf<std::string>({"1.4 MHz", "3 MHz", "5 MHz", "10 MHz", "15 MHz", "20 MHz"}));
    EXPECT_EQ(types, (std::set<std::string>{"LTE", "UTRAN", "GERAN", "CDMA1XRTT", "CDMAHRPD", "?\?"}));
    EXPECT_EQ(node("SIM Info").asDictionary()->size(), 14u);
}

TEST_F(LTEDisplayTest, shownValuesArePlausible) {
    const auto number = [](const Value& row, std::string_view label) { return std::stod(text(row, label)); };
    play<LTEScenario>(2, 4min, [&] {
        const Value& serving = node("Serving Cell", "Serving Cell Measurements");
        if (!serving.asDictionary()->empty()) {
            EXPECT_GE(number(serving, "Measured RSRP"), -140);
            EXPECT_LE(number(serving, "Measured RSRP"), -44);
            EXPECT_GE(number(serving, "Average RSRQ"), -19.5);
            EXPECT_LE(number(serving, "Average RSRQ"), -3);
            EXPECT_LE(number(serving, "Measured RSSI"), -12.5);
            EXPECT_EQ(text(serving, "Qrxlevmin"), "-120 dBm");
            EXPECT_EQ(text(serving, "Max UE Tx Power"), "23 dBm");
            EXPECT_EQ(text(serving, "S Intra Search"), "46 dB");
            EXPECT_THAT(text(serving, "P_Max"), ::testing::AnyOf("23 dBm", "Not Present"));
            EXPECT_THAT(text(serving, "S Non Intra Search"), ::testing::AnyOf("8 dBm", "Not Present"));
            // What the cell has above the least level; rounded.
            EXPECT_NEAR(number(serving, "Srxlev"), number(serving, "Measured RSRP") + 120, 0.75);
        }
        for (const Value& row : *node("Idle Mode Neighbors", "Neighbor Cells List").asArray()) {
            EXPECT_LE(number(row, "Physical Cell ID"), 503);
            EXPECT_GE(number(row, "Measured RSRP"), -140);
            EXPECT_LE(number(row, "Measured RSRP"), -44);
            EXPECT_LE(number(row, "Measured RSRP"), number(row, "Measured RSSI"));
            EXPECT_LT(number(row, "Ant 0 Frame Offset"), 1024);
            EXPECT_LT(number(row, "Ant 0 Sample Offset"), 307200);
        }
        const Array& candidates = *node("Reselection", "Reselection Candidates List").asArray();
        // Of several, only the last one's fields are its own.
        if (candidates.size() == 1) {
            const Value& row = candidates[0];
            const std::string type = text(row, "Candidate RAT Type");
            EXPECT_LE(number(row, "Candidate Priority"), 7);
            if (type == "LTE") {
                EXPECT_THAT(text(row, "E ARFCN"),
                            ::testing::AnyOf("1300", "3175", "6300", "9310", "3625", "2410"));
                EXPECT_LE(number(row, "Cell ID"), 503);
            } else if (type == "UTRAN") {
                EXPECT_THAT(text(row, "U ARFCN"), ::testing::AnyOf("10588", "10738"));
                EXPECT_LE(number(row, "PSC"), 511);
            } else if (type == "GERAN") {
                EXPECT_LE(number(row, "ARFCN"), 885);
                EXPECT_LE(number(row, "Band"), 1);
                EXPECT_LE(number(row, "BSIC ID"), 63);
            } else if (type != "?\?") {
                EXPECT_THAT(text(row, "Channel"), ::testing::AnyOf("283", "384", "425", "450"));
                EXPECT_LE(number(row, "Pilot"), 511);
            }
        }
    });
}

TEST_F(LTEDisplayTest, onlyTheUnusualMessagesAreReported) {
    play<LTEScenario>(3, 20min, [] {});
    int wrongType = 0;
    int antennas = 0;
    std::map<std::string, int> overruns;
    for (const std::string& line : errors) {
        if (line == "Invalid log type: 2. Dropping.")
            ++wrongType;
        else if (line == "Received an unknown log message: 45249")
            ++antennas; // follows every good record of the antennas
        else if (line.starts_with("Record 0x"))
            ++overruns[line.substr(7, 6)];
        else
            ADD_FAILURE() << line;
    }
    EXPECT_GE(wrongType, 5);
    EXPECT_GE(antennas, 100);
    EXPECT_EQ(overruns.size(), 3u);
    for (const char* code : {"0xB179", "0xB180", "0xB186"})
        EXPECT_GE(overruns[code], 2) << code;
}

} // namespace
} // namespace velmora
