// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/SeveralTechnologies.h"

#include <gmock/gmock.h>

#include <string>

// What `decode` does with a file of several technologies.

namespace velmora {
namespace {

class DecodeTechnologiesTest : public SeveralTechnologiesTest {};

const std::string gsmText = "GSM RR Info\n"
                            "  RR State      RR_IDLE\n"
                            "  RR Sub State  0\n"
                            "  RR Status     1\n"
                            "  RR Mode       Voice\n"
                            "UMTS RR Info\n"
                            "SIM Info\n";
const std::string ifxText = "Band   GSM 1800\nState  idle\n";
const std::string ifxJson = R"({
  "technology": "IFX",
  "messages": 2,
  "display": {
    "Band": "GSM 1800",
    "State": "idle"
  }
}
)";

/// What a line of csv begins with, so many seconds and tenths after the first message.
std::string second(const char* time) {
    return "2026-11-16T05:00:0" + std::string(time) + "00000000Z,";
}

TEST_F(DecodeTechnologiesTest, TextHasOneDisplayAfterTheOther) {
    write("both.pcapng", both());
    EXPECT_EQ(run({"decode", path("both.pcapng")}),
              "== Ostrel_GSM ==\n" + gsmText + "\n== IFX ==\n" + ifxText);
    writeRecording("gsm.pcapng", "Ostrel_GSM", {{at(0), rrState(5)}});
    EXPECT_EQ(run({"decode", path("both.pcapng"), path("gsm.pcapng")}),
              "== " + path("both.pcapng") + ": Ostrel_GSM ==\n" + gsmText + "\n== " + path("both.pcapng") +
                  ": IFX ==\n" + ifxText + "\n== " + path("gsm.pcapng") + " ==\n" + gsmText);
}

TEST_F(DecodeTechnologiesTest, JsonHasAnObjectForEach) {
    write("both.pcapng", both());
    const std::string json = run({"decode", "--format", "json", path("both.pcapng")});
    EXPECT_THAT(json, testing::StartsWith("{\n  \"technology\": \"Ostrel_GSM\",\n  \"messages\": 2,\n"));
    EXPECT_THAT(json, testing::EndsWith("\n}\n" + ifxJson));
    EXPECT_EQ(run({"decode", "--format", "json", "--technology", "IFX", path("both.pcapng")}), ifxJson);
}

TEST_F(DecodeTechnologiesTest, RowsNameTheTechnologyInTheOrderOfTime) {
    write("both.pcapng", both());
    const std::vector<std::string> csv = {
        "decode", "--format",         "csv", "--select", "/GSM RR Info/RR State", "--select",
        "/Band",  path("both.pcapng")};
    const std::string header = "time,technology,/GSM RR Info/RR State,/Band\r\n";
    EXPECT_EQ(run(csv), header + second("2.0") + "Ostrel_GSM,RR_PLMN_LIST_CONSTRUCTION,\r\n" + second("2.5") +
                            "IFX,,GSM 900\r\n" + second("4.0") + "Ostrel_GSM,RR_IDLE,\r\n" + second("8.5") +
                            "IFX,,GSM 1800\r\n");
    std::vector<std::string> every = csv;
    every.insert(every.end(), {"--every", "message"});
    EXPECT_EQ(run(every), header + second("0.0") + "Ostrel_GSM,RR_PLMN_LIST_CONSTRUCTION,\r\n" +
                              second("0.5") + "IFX,,GSM 900\r\n" + second("2.1") + "Ostrel_GSM,RR_IDLE,\r\n" +
                              second("7.0") + "IFX,,GSM 1800\r\n");
    std::vector<std::string> one = csv;
    one.insert(one.end(), {"--technology", "IFX"});
    EXPECT_EQ(run(one), "time,/GSM RR Info/RR State,/Band\r\n" + second("2.5") + ",GSM 900\r\n" +
                            second("8.5") + ",GSM 1800\r\n");
}

TEST_F(DecodeTechnologiesTest, RowsOfAFileOfOneNameItWhereAnotherFileHasSeveral) {
    write("both.pcapng", both());
    writeRecording("gsm.pcapng", "Ostrel_GSM", {{at(0), rrState(5)}});
    EXPECT_THAT(run({"decode", "--format", "csv", "--jobs", "2", "--select", "/GSM RR Info/RR State",
                     path("both.pcapng"), path("gsm.pcapng")}),
                testing::EndsWith(second("8.5") + path("both.pcapng") + ",IFX,\r\n" + second("2.0") +
                                  path("gsm.pcapng") + ",Ostrel_GSM,RR_IDLE\r\n"));
}

TEST_F(DecodeTechnologiesTest, LinesOfMessagesNameTheTechnology) {
    PcapngFile file = both();
    write("both.pcapng", file);
    const std::vector<std::string> arguments = {"decode",  "--format", "jsonl", "--every",
                                                "message", "--to",     "+1",    path("both.pcapng")};
    const std::string expected =
        R"({"time":"2026-11-16T05:00:00.000000000Z","technology":"Ostrel_GSM","code":20780,"sections":{)"
        R"("GSM RR Info":{"RR State":"RR_PLMN_LIST_CONSTRUCTION","RR Sub State":"0","RR Status":"1",)"
        R"("RR Mode":"Voice"}}})"
        "\n"
        R"({"time":"2026-11-16T05:00:00.500000000Z","technology":"IFX",)"
        R"("display":{"Band":"GSM 900","State":"idle"}})"
        "\n";
    EXPECT_EQ(run(arguments), expected);
    std::vector<std::string> piped = arguments;
    piped.back() = "-";
    EXPECT_EQ(run(piped, 0, contentOf("both.pcapng")), expected);
}

TEST_F(DecodeTechnologiesTest, SecondSectionMayHaveAnotherTechnology) {
    PcapngFile file;
    file.section().messageInterface("IFX").message(stamp(0), ifxBand("GSM 1800").bytes());
    file.message(stamp(1), ifxBand("GSM 1800").bytes());
    file.section().messageInterface("Ostrel_GSM").message(stamp(2), rrState(5).bytes());
    write("cat.pcapng", file);
    const std::string expected = "== IFX ==\n" + ifxText + "\n== Ostrel_GSM ==\n" + gsmText;
    EXPECT_EQ(run({"decode", path("cat.pcapng")}), expected);
    EXPECT_EQ(run({"decode", "-"}, 0, contentOf("cat.pcapng")), expected);
    EXPECT_EQ(run({"decode", "--technology", "Ostrel_GSM", path("cat.pcapng")}), gsmText);
    EXPECT_EQ(run({"decode", "--format", "json", "--technology", "IFX", path("cat.pcapng")}), ifxJson);
    // Whether csv has a column for the technology is not known of a pipe when the first row is written.
    EXPECT_THAT(run({"decode", "--format", "csv", "--select", "/Band", "-"}, 1, contentOf("cat.pcapng")),
                testing::EndsWith(",GSM 1800\r\n"));
    EXPECT_THAT(_errors, testing::EndsWith(": message of Ostrel_GSM in a recording of IFX\n"));
}

TEST_F(DecodeTechnologiesTest, TimesCountFromTheFirstMessageOfTheFile) {
    write("both.pcapng", both());
    const std::vector<std::string> part = {"decode",  "--format", "csv",    "--select", "/Band",
                                           "--every", "message",  "--from", "+0.5",     path("both.pcapng")};
    EXPECT_EQ(run(part), "time,technology,/Band\r\n" + second("0.5") + "IFX,GSM 900\r\n" + second("2.1") +
                             "Ostrel_GSM,\r\n" + second("7.0") + "IFX,GSM 1800\r\n");
    std::vector<std::string> one = part;
    one.insert(one.end(), {"--technology", "IFX"});
    EXPECT_EQ(run(one), "time,/Band\r\n" + second("0.5") + "GSM 900\r\n" + second("7.0") + "GSM 1800\r\n");
}

TEST_F(DecodeTechnologiesTest, TechnologyThatTheFileLacksIsRefused) {
    write("both.pcapng", both());
    EXPECT_EQ(run({"decode", "--technology", "Ostrel_LTE", path("both.pcapng")}, 1), "");
    EXPECT_EQ(_errors, "velmora-log: " + path("both.pcapng") +
                           ": holds Ostrel_GSM and IFX, wanted one of these and not Ostrel_LTE\n");
}

TEST_F(DecodeTechnologiesTest, UnknownTechnologyBesideAKnownOneIsReported) {
    PcapngFile file;
    file.section().messageInterface("IFX").messageInterface("Nonesuch").messageInterface("Ostrel_GSM");
    file.message(stamp(0), ifxBand("GSM 1800").bytes(), 0).message(stamp(1), hex("01").bytes(), 1);
    write("odd.pcapng", file);
    // The last one has no message, and so nothing to show.
    EXPECT_EQ(run({"decode", path("odd.pcapng")}, 1), "== IFX ==\n" + ifxText + "\n== Ostrel_GSM ==\n");
    EXPECT_THAT(_errors, testing::HasSubstr(": record 2 at offset "));
    EXPECT_THAT(_errors, testing::HasSubstr(": technology \"Nonesuch\" is unknown, wanted one of "));
    EXPECT_THAT(_errors, testing::EndsWith(": 1 message could not be decoded\n"));
}

} // namespace
} // namespace velmora
