// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Decode/Samples/SamplesFixture.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

// `decode --samples`: a line for each value.

namespace velmora {
namespace {

using Json = nlohmann::ordered_json;
using testing::ElementsAre;

class LongSamplesTest : public SamplesTest {};

// The records' time stamp is 0, the beginning of system time.
TEST_F(LongSamplesTest, LinesHaveWhatIsKnownOfAValue) {
    writeDrive("a.pcapng");
    EXPECT_EQ(samples({"--format", "jsonl", "--select", "/GSM RR Info/RR State", "--select",
                       "status=/GSM RR Info/RR Status", path("a.pcapng")}),
              R"({"time":"2026-11-16T05:00:00.000000000Z","modemTime":"1980-01-06T00:00:00.000000000Z",)"
              R"("path":"/GSM RR Info/RR State","value":4,"text":"RR_PLMN_LIST_CONSTRUCTION",)"
              R"("code":20780,"record":1})"
              "\n"
              R"({"time":"2026-11-16T05:00:00.000000000Z","modemTime":"1980-01-06T00:00:00.000000000Z",)"
              R"("name":"status","path":"/GSM RR Info/RR Status","value":1,"text":"1",)"
              R"("code":20780,"record":1})"
              "\n"
              R"({"time":"2026-11-16T05:00:02.000000000Z","modemTime":"1980-01-06T00:00:00.000000000Z",)"
              R"("path":"/GSM RR Info/RR State","value":5,"text":"RR_IDLE","code":20780,"record":3})"
              "\n"
              R"({"time":"2026-11-16T05:00:02.000000000Z","modemTime":"1980-01-06T00:00:00.000000000Z",)"
              R"("name":"status","path":"/GSM RR Info/RR Status","value":1,"text":"1",)"
              R"("code":20780,"record":3})"
              "\n");
}

TEST_F(LongSamplesTest, RowsHaveTheSame) {
    writeDrive("a.pcapng");
    const std::string header = "time,modem_time,path,row,value,unit,text,code,record\r\n";
    const std::string first = "2026-11-16T05:00:00.000000000Z,1980-01-06T00:00:00.000000000Z,";
    const std::string second = "2026-11-16T05:00:02.000000000Z,1980-01-06T00:00:00.000000000Z,";
    EXPECT_EQ(samples({"--format", "csv", "--select", "s=/GSM RR Info/RR State", path("a.pcapng")}),
              header + first + "s,,4,,RR_PLMN_LIST_CONSTRUCTION,0x512C,1\r\n" + second +
                  "s,,5,,RR_IDLE,0x512C,3\r\n");
    // Without a selection, all that was reported.
    EXPECT_EQ(samples({"--format", "csv", "--from", "+2", path("a.pcapng")}),
              header + second + "/GSM RR Info/RR State,,5,,RR_IDLE,0x512C,3\r\n" + second +
                  "/GSM RR Info/RR Sub State,,0,,0,0x512C,3\r\n" + second +
                  "/GSM RR Info/RR Status,,1,,1,0x512C,3\r\n" + second +
                  "/GSM RR Info/RR Mode,,false,,Voice,0x512C,3\r\n");
}

TEST_F(LongSamplesTest, SeveralFilesAndTechnologiesAreNamed) {
    write("both.pcapng", both());
    const std::vector<std::string> select = {"--select", "/GSM RR Info/RR State", "--select", "/Band"};
    const auto with = [&](std::vector<std::string> arguments) {
        arguments.insert(arguments.end(), select.begin(), select.end());
        return samples(arguments);
    };
    EXPECT_THAT(lines(with({"--format", "csv", "--to", "+2", path("both.pcapng")})),
                ElementsAre("time,technology,modem_time,path,row,value,unit,text,code,record",
                            "2026-11-16T05:00:00.000000000Z,Ostrel_GSM,1980-01-06T00:00:00.000000000Z,"
                            "/GSM RR Info/RR State,,4,,RR_PLMN_LIST_CONSTRUCTION,0x512C,1",
                            "2026-11-16T05:00:00.500000000Z,IFX,,/Band,,GSM 900,,GSM 900,,2"));
    EXPECT_THAT(lines(with({"--format", "jsonl", "--to", "+2", "--from", "+0.5", path("both.pcapng")})),
                ElementsAre(R"({"time":"2026-11-16T05:00:00.500000000Z","technology":"IFX",)"
                            R"("path":"/Band","value":"GSM 900","text":"GSM 900","code":null,"record":2})"));
    writeDrive("a.pcapng");
    writeDrive("b.pcapng");
    EXPECT_EQ(table(samples({"--format", "csv", path("a.pcapng"), path("b.pcapng"), "--to", "+1"}))[5][1],
              path("b.pcapng"));
    const Json line = Json::parse(
        lines(samples({"--format", "jsonl", path("a.pcapng"), path("b.pcapng"), "--to", "+1"}))[4]);
    EXPECT_EQ(line["file"], path("b.pcapng"));
}

// The byte at 15 of the record is the level's amount, which the display shows without its sign.
TEST_F(LongSamplesTest, ServingLevelOfGSMIsNegative) {
    const auto rows = table(samplesOfRecording(
        {"--format", "csv", "--select", "level=/GSM/GSM Serving Cell/RSSI", recording("gsm")}));
    const std::vector<std::string> expected = recordValues({recording("gsm"), "0x5137", "15"});
    ASSERT_EQ(rows.size(), expected.size() + 1);
    ASSERT_GT(expected.size(), 50U);
    for (std::size_t i = 0; i < expected.size(); ++i) {
        const std::vector<std::string>& row = rows[i + 1];
        const std::string amount = expected[i].substr(expected[i].find(' ') + 1);
        EXPECT_EQ(row[2], "level");
        EXPECT_EQ(row[4], "-" + amount);
        EXPECT_EQ(row[5], "dBm");
        EXPECT_EQ(row[6], amount + " dBm");
        EXPECT_EQ(row[7], "0x5137");
        EXPECT_EQ(row[8] + " " + amount, expected[i]);
    }
}

// Each message is the whole account, so that there are as many values as messages that have one.
TEST_F(LongSamplesTest, ValuesOfALiveModemAreThoseOfItsPropertyLists) {
    struct Compared {
        const char* path;
        const char* unit;
        std::vector<std::string> from; ///< where record-values.py finds the values
    };
    const Compared all[] = {
        {"/Serving Cell/RSRP", "dBm", {"0xFF0001:list", "kVoxCellMonitorCells", "0", "kVoxCellMonitorRSRP"}},
        {"/Serving Cell/SINR", "dB", {"0xFF0001:list", "kVoxCellMonitorCells", "0", "kVoxCellMonitorSINR"}},
        {"/Serving Cell/EARFCN", "", {"0xFF0001:list", "kVoxCellMonitorCells", "0", "kVoxCellMonitorEARFCN"}},
        {"/Position/Latitude", "\u00B0", {"0xFF0007:list", "kVoxPositionLatitude"}},
    };
    for (const Compared& compared : all) {
        SCOPED_TRACE(compared.path);
        std::vector<std::string> arguments = compared.from;
        arguments.insert(arguments.begin(), recording("modem"));
        const std::vector<std::string> expected = recordValues(arguments);
        const std::vector<std::string> found =
            lines(samplesOfRecording({"--format", "jsonl", "--select", compared.path, recording("modem")}));
        ASSERT_GT(expected.size(), 5U);
        ASSERT_EQ(found.size(), expected.size());
        for (std::size_t i = 0; i < found.size(); ++i) {
            const Json sample = Json::parse(found[i]);
            const std::size_t blank = expected[i].find(' ');
            EXPECT_EQ(std::to_string(sample["record"].get<int>()), expected[i].substr(0, blank));
            EXPECT_DOUBLE_EQ(sample["value"].get<double>(), std::stod(expected[i].substr(blank)));
            EXPECT_EQ(sample.value("unit", ""), compared.unit);
        }
    }
}

// In an entry of 14 bytes from 29 on, the channel is at 0 and the level's amount at 2.
TEST_F(LongSamplesTest, ARowOfAListHasItsKey) {
    std::vector<std::string> shown;
    for (const std::string& line :
         lines(samplesOfRecording({"--format", "jsonl", "--select", "/GSM/Neighboring Cells/1/RSSI", "--code",
                                   "0x5137", recording("gsm")}))) {
        const Json sample = Json::parse(line);
        EXPECT_EQ(sample["path"], "/GSM/Neighboring Cells/1/RSSI");
        EXPECT_EQ(sample["unit"], "dBm");
        shown.push_back(std::to_string(sample["record"].get<int>()) + " " +
                        std::to_string(-sample["value"].get<int>()));
    }
    EXPECT_EQ(shown, recordValues({recording("gsm"), "0x5137", "45"}));
    ASSERT_GT(shown.size(), 50U);
    for (const std::string& line :
         lines(samplesOfRecording({"--format", "jsonl", "--select", "/GSM/Neighboring Cells/*/ARFCN",
                                   "--select", "/GSM/Neighboring Cells/*/RSSI", recording("gsm")}))) {
        const Json sample = Json::parse(line);
        const std::string row = sample["row"];
        if (sample["path"].get<std::string>().ends_with("ARFCN"))
            // The channel and, where it is known, the cell's BSIC.
            EXPECT_EQ(std::to_string(sample["value"].get<int>()), row.substr(0, row.find('/')));
        else
            EXPECT_LT(sample["value"], 0);
    }
}

TEST_F(LongSamplesTest, AnAbsentValueHasItsText) {
    writeRecording("c.pcapng", "Ostrel_CDMA", {{at(0), record(0x108A, "00 00 00 00 00 00 00 00 00 00")}});
    const std::vector<std::string> csv =
        lines(samplesOfRecording({"--format", "csv", "--select", "/EV-DO/Fingers", path("c.pcapng")}));
    ASSERT_EQ(csv.size(), 2U);
    EXPECT_THAT(csv[1], testing::EndsWith(",/EV-DO/Fingers,,,,(none),0x108A,1"));
    const Json line = Json::parse(
        samplesOfRecording({"--format", "jsonl", "--select", "/EV-DO/Fingers", path("c.pcapng")}));
    EXPECT_TRUE(line["value"].is_null());
    EXPECT_EQ(line["text"], "(none)");
}

} // namespace
} // namespace velmora
