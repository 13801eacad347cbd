// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Decode/DecodeLinesFixture.h"

#include <string>

// What `decode` prints row by row, as CSV.

namespace velmora {
namespace {

class DecodeRowsTest : public DecodeLinesTest {};

TEST_F(DecodeRowsTest, CsvHasARowForEachRefreshAndACellForEachPath) {
    writeDrive("a.pcapng");
    EXPECT_EQ(decode({"--format", "csv", "--select", "/GSM RR Info/RR State", "--select",
                      "a, \"b\"=/SIM Info/EF-LOCI", path("a.pcapng"), "--select", "/UMTS RR Info"}),
              "time,/GSM RR Info/RR State,\"a, \"\"b\"\"\",/UMTS RR Info\r\n"
              "2026-11-16T05:00:02.000000000Z,RR_PLMN_LIST_CONSTRUCTION,,{}\r\n"
              "2026-11-16T05:00:04.000000000Z,RR_IDLE,,{}\r\n");
}

TEST_F(DecodeRowsTest, CsvOfSeveralFilesHasAColumnForThem) {
    writeDrive("a.pcapng");
    writeDrive("b,c.pcapng");
    EXPECT_EQ(decode({"--format", "csv", "--select", "/GSM RR Info/RR State", "--to", "+2", path("a.pcapng"),
                      path("b,c.pcapng")}),
              "time,file,/GSM RR Info/RR State\r\n"
              "2026-11-16T05:00:02.000000000Z," +
                  path("a.pcapng") +
                  ",RR_PLMN_LIST_CONSTRUCTION\r\n"
                  "2026-11-16T05:00:02.000000000Z,\"" +
                  path("b,c.pcapng") + "\",RR_PLMN_LIST_CONSTRUCTION\r\n");
}

TEST_F(DecodeRowsTest, CsvMayHaveARowForEachMessage) {
    writeDrive("a.pcapng");
    EXPECT_EQ(decode({"--format", "csv", "--every", "message", "--select", "/GSM RR Info/RR State", "--from",
                      "2026-11-16T05:00:01.5Z", path("a.pcapng")}),
              "time,/GSM RR Info/RR State\r\n"
              "2026-11-16T05:00:01.500000000Z,\r\n" // the message that set it lies outside
              "2026-11-16T05:00:02.000000000Z,RR_IDLE\r\n");
}

TEST_F(DecodeRowsTest, SafeCsvHasNoFormulasInAnyOfItsForms) {
    const Value message(std::make_shared<Dictionary>(
        std::initializer_list<Dictionary::Entry>{{"A", "=1+1"}, {"B", "-71"}, {"=C", "@SUM"}}));
    writeRecording("i.pcapng", "IFX", {{at(0), serialized(message)}});
    const std::string file = path("i.pcapng");
    EXPECT_EQ(decode({"--safe", "--format", "csv", "--select", "=a=/A", "--select", "/B", "--select",
                      "all=/*", file}),
              "time,'=a,/B,all\r\n"
              "2026-11-16T05:00:02.000000000Z,'=1+1,-71,'=1+1; -71; @SUM\r\n");
    EXPECT_EQ(decode({"--format", "csv", "--select", "/A", file}),
              "time,/A\r\n2026-11-16T05:00:02.000000000Z,=1+1\r\n");
    EXPECT_EQ(
        decode({"--safe", "--samples", "--format", "csv", "--select", "=a=/A", "--select", "/=C", file}),
        "time,modem_time,path,row,value,unit,text,code,record\r\n"
        "2026-11-16T05:00:00.000000000Z,,'=a,,'=1+1,,'=1+1,,1\r\n"
        "2026-11-16T05:00:00.000000000Z,,/=C,,'@SUM,,'@SUM,,1\r\n");
    EXPECT_EQ(decode({"--safe", "--samples", "--wide", "--format", "csv", "--select", "=a=/A", "--select",
                      "/=C", file}),
              "time,modem_time,code,record,row,'=a,/=C\r\n"
              "2026-11-16T05:00:00.000000000Z,,,1,,'=1+1,'@SUM\r\n");
}

} // namespace
} // namespace velmora
