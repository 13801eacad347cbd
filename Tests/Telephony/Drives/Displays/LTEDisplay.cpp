// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/Drives/Displays/ExpectedDisplays.h"

#include <string_view>

namespace velmora {

namespace {

const Value& node(const Dictionary& display, std::string_view group, std::string_view section) {
    return (*display[group].asDictionary())[section];
}

std::string text(const Value& row, std::string_view label) {
    const std::string* shown = (*row.asDictionary())[label].asString();
    return shown ? *shown : "(none)";
}

double number(const Value& row, std::string_view label) {
    return std::stod(text(row, label));
}

/// A candidate alone; of several, only the last one's fields are its own.
void expectCandidate(const Value& row) {
    const std::string type = text(row, "Candidate RAT Type");
    EXPECT_LE(number(row, "Candidate Priority"), 7);
    if (type == "LTE") {
        EXPECT_THAT(text(row, "E ARFCN"), testing::AnyOf("1300", "3175", "6300", "9310", "3625", "2410"));
        EXPECT_LE(number(row, "Cell ID"), 503);
    } else if (type == "UTRAN") {
        EXPECT_THAT(text(row, "U ARFCN"), testing::AnyOf("10588", "10738"));
        EXPECT_LE(number(row, "PSC"), 511);
    } else if (type == "GERAN") {
        EXPECT_LE(number(row, "ARFCN"), 885);
        EXPECT_LE(number(row, "Band"), 1);
        EXPECT_LE(number(row, "BSIC ID"), 63);
    } else if (type != "?\?") {
        EXPECT_THAT(text(row, "Channel"), testing::AnyOf("283", "384", "425", "450"));
        EXPECT_LE(number(row, "Pilot"), 511);
    }
}

void expectRelations(const Dictionary& display) {
    const Value& serving = node(display, "Serving Cell", "Serving Cell Measurements");
    if (!serving.asDictionary()->empty()) {
        // What the cell has above the least level, -120 dBm; rounded.
        EXPECT_NEAR(number(serving, "Srxlev"), number(serving, "Measured RSRP") + 120, 0.75);
    }
    for (const Value& row : *node(display, "Idle Mode Neighbors", "Neighbor Cells List").asArray())
        EXPECT_LE(number(row, "Measured RSRP"), number(row, "Measured RSSI"));
    const Array& candidates = *node(display, "Reselection", "Reselection Candidates List").asArray();
    if (candidates.size() == 1)
        expectCandidate(candidates[0]);
}

} // namespace

ExpectedDisplay expectedLTEDisplay() {
    using testing::Ge;

    // A carrier each of the bands 3, 5, 7, 8, 20 and 28; its uplink has the number of its downlink and 18000
    // (3GPP TS 36.101 5.7.3).
    const Texts bands = {"3", "5", "7", "8", "20", "28"};
    const Texts downlinks = {"1300", "2410", "3175", "3625", "6300", "9310"};
    const Texts uplinks = {"19300", "20410", "21175", "21625", "24300", "27310"};
    const Texts bandwidths = {"1.4 MHz", "3 MHz", "5 MHz", "10 MHz", "15 MHz", "20 MHz"};
    const auto cellIdentities = numbers(0, 503);
    // The reporting ranges of 3GPP TS 36.133 9.1.4 and 9.1.7.
    const auto levels = numbers(-140, -44, " dBm");
    const auto qualities = numbers(-19.5, -3, " dB");
    const auto anyNumbers = numbers(0, 65535);
    const auto flags = exactly({"True", "False"});

    const std::string cell = "/Serving Cell/Serving Cell Info/";
    const std::string serving = "/Serving Cell/Serving Cell Measurements/";
    const std::string idle = "/Idle Mode Neighbors/Neighbor Measurements/";
    const std::string neighbours = "/Idle Mode Neighbors/Neighbor Cells List";
    const std::string reselection = "/Reselection/Reselection Candidates/";
    const std::string candidates = "/Reselection/Reselection Candidates List";
    const std::string connected = "/Connected Mode/Connected mode LTE Intra-frequency Measurement/";
    const std::string measured = "/Connected Mode/Measured Neighbor Cells";
    const std::string detected = "/Connected Mode/Detected Cells";
    ExpectedDisplay display;
    display.scenario = "lte";
    display.templateName = "LTE";
    display.texts = {
        {cell + "Physical Cell ID", cellIdentities},
        {cell + "Download Frequency", exactly(downlinks)},
        {cell + "Upload Frequency", exactly(uplinks)},
        {cell + "Download Bandwidth", exactly(bandwidths)},
        {cell + "Upload Bandwidth", exactly(bandwidths)},
        {cell + "Cell Identity", numbers(0, (1 << 28) - 1)},
        {cell + "Tracking Area Code", changing("0|7101|7102|8201")},
        {cell + "Freq Band Indicator", exactly(bands)},
        {cell + "Num Tx Antennas", exactly({"1", "2", "4"})},
        {cell + "UARFCN", changing("1300|2410|3175|3625|6300|9310")}, // while the baseband has sent none
        {serving + "Version", exactly({"1"})},
        {serving + "E-ARFCN", exactly(downlinks)},
        {serving + "Physical Cell ID", cellIdentities},
        {serving + "Serving Layer Priority", numbers(0, 7)},
        {serving + "Measured RSRP", levels},
        {serving + "Average RSRP", levels},
        {serving + "Measured RSRQ", qualities},
        {serving + "Average RSRQ", qualities},
        {serving + "Measured RSSI", numbers(-140, -12.5, " dBm")},
        {serving + "Qrxlevmin", exactly({"-120 dBm"})},
        {serving + "P_Max", exactly({"23 dBm", "Not Present"})},
        {serving + "Max UE Tx Power", exactly({"23 dBm"})},
        {serving + "Srxlev", numbers(-30, 97, " dBm")},
        {serving + "Num of Consecutive DRX Cycles of S < 0", testing::Each(IsNumber(0, 63, ""))},
        {serving + "S Intra Search", exactly({"46 dB"})},
        {serving + "S Non Intra Search", exactly({"8 dBm", "Not Present"})},
        {serving + "Measurement Rules Updated", flags},
        {serving + "Measurement Rules", numbers(0, 15)},
        {idle + "Version", exactly({"1"})},
        {idle + "E-ARFCN", exactly(downlinks)},
        {idle + "Qrxlevmin", exactly({"-120 dBm"})},
        {neighbours + "/Physical Cell ID", cellIdentities},
        {neighbours + "/Measured RSSI", numbers(-140, -12.5, " dBm")},
        {neighbours + "/Measured RSRP", levels},
        {neighbours + "/Average RSRP", levels},
        {neighbours + "/Measured RSRQ", qualities},
        {neighbours + "/Average RSRQ", qualities},
        {neighbours + "/Srxlev", numbers(-30, 97, " dBm")},
        {neighbours + "/Frequency Offset", anyNumbers},
        {neighbours + "/Ant 0 Frame Offset", numbers(0, 1023)},
        {neighbours + "/Ant 0 Sample Offset", numbers(0, 307199)}, // of 10 ms at 30.72 MHz
        {neighbours + "/Ant 1 Frame Offset", numbers(0, 1023)},
        {neighbours + "/Ant 1 Sample Offset", numbers(0, 307199)},
        {reselection + "Version", exactly({"1"})},
        {reselection + "Serving EARFCN", exactly(downlinks)},
        {reselection + "Serving Cell ID", cellIdentities},
        {candidates + "/Candidate Priority", anyNumbers},
        {candidates + "/Candidate RAT Type",
         exactly({"LTE", "UTRAN", "GERAN", "CDMA1XRTT", "CDMAHRPD", "?\?"})},
        {candidates + "/E ARFCN", anyNumbers},
        {candidates + "/Cell ID", cellIdentities},
        {candidates + "/U ARFCN", anyNumbers},
        {candidates + "/PSC", numbers(0, 511)},
        {candidates + "/ARFCN", numbers(0, 1023)},
        {candidates + "/Band", exactly({"0", "1"})},
        {candidates + "/BSIC ID", numbers(0, 63)},
        {candidates + "/Channel", exactly({"283", "384", "425", "450"})},
        {candidates + "/Pilot", numbers(0, 511)},
        {connected + "E-ARFCN", exactly(downlinks)},
        {connected + "Serving Physical Cell ID", cellIdentities},
        {connected + "Subframe Number", numbers(0, 10239)}, // ten of each of 1024 frames
        {connected + "Serving Filtered RSRP", levels},
        {connected + "Serving Filtered RSRQ", qualities},
        {measured + "/Physical Cell ID", cellIdentities},
        {measured + "/Filtered RSRP", levels},
        {measured + "/Filtered RSRQ", qualities},
        {detected + "/Physical Cell ID", cellIdentities},
    };
    display.lengths = {
        {neighbours, upTo(6)},
        {candidates, upTo(3)},
        {measured, upTo(6)},
        {detected, upTo(3)},
    };
    display.relations = expectRelations;
    display.reports = {
        {"Invalid log type: 2\\. Dropping\\.", Ge(5)},
        {"Received an unknown log message: 45249", Ge(100)}, // follows every good record of the antennas
        {"Record 0xB179: .*", Ge(2)},
        {"Record 0xB180: .*", Ge(2)},
        {"Record 0xB186: .*", Ge(2)},
    };
    addServiceTexts(display, "/Packet Data/PDP Context Info");
    return display;
}

} // namespace velmora
