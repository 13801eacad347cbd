// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <algorithm>

// What `decode` does with messages that end the application.

namespace velmora {
namespace {

class UndecodedMessagesTest : public ToolTest {
protected:
    /// Standard output; the exit status is 1.
    std::string decode(std::vector<std::string> arguments) {
        arguments.insert(arguments.begin(), {"decode", "--log-level", "0"});
        ToolProcess process(tool(std::move(arguments)));
        EXPECT_EQ(process.exitStatus(), 1);
        _errors = ownMessages(process.errors());
        return process.output();
    }

    const Data _unreadableSim = record(0x0000, "DE AD BE EF", 0xFF);
    std::string _errors;
};

constexpr const char* simReason = ": SIM File dictionary data could not be constructed\n";

TEST_F(UndecodedMessagesTest, UnreadableSimFilesAreReportedAndTheRestDecoded) {
    const std::vector<std::uint64_t> offsets = writeRecording(
        "sim.pcapng", "Ostrel_GSM", {{at(0), rrState(5)}, {at(1), _unreadableSim}, {at(2), rrState(4)}});
    EXPECT_EQ(decode({"--format", "json", path("sim.pcapng")}), R"({
  "technology": "Ostrel_GSM",
  "messages": 3,
  "display": {
    "GSM RR Info": {
      "RR State": "RR_PLMN_LIST_CONSTRUCTION",
      "RR Sub State": "0",
      "RR Status": "1",
      "RR Mode": "Voice"
    },
    "UMTS RR Info": {},
    "SIM Info": {}
  }
}
)");
    EXPECT_EQ(_errors, "velmora-log: " + path("sim.pcapng") + ": record 2 at offset " +
                           std::to_string(offsets[1]) + simReason + "velmora-log: " + path("sim.pcapng") +
                           ": 1 message could not be decoded\n");
}

TEST_F(UndecodedMessagesTest, LeaveTheDisplayAsItWasAndHaveNoLine) {
    const DictionaryRef files = makeDictionary();
    files->set("kSimFile_ICCID", "8949");
    writeRecording("sim.pcapng", "Ostrel_GSM",
                   {{at(0), _unreadableSim}, {at(1), extraRecord(0, files)}, {at(2), _unreadableSim}});
    EXPECT_EQ(decode({"--format", "csv", "--every", "message", "--select", "/SIM Info/EF-ICCID",
                      path("sim.pcapng")}),
              "time,/SIM Info/EF-ICCID\r\n2026-11-16T05:00:00.001000000Z,8949\r\n");
    EXPECT_EQ(decode({"--format", "jsonl", "--every", "message", path("sim.pcapng")}),
              R"({"time":"2026-11-16T05:00:00.001000000Z","code":16711680,)"
              R"("sections":{"SIM Info":{"EF-ICCID":"8949"}}})"
              "\n");
    EXPECT_EQ(decode({"--select", "/SIM Info", path("sim.pcapng")}), "SIM Info\n  EF-ICCID  8949\n");
}

TEST_F(UndecodedMessagesTest, SerializedObjectsThatCannotBeReadLeaveTheOnesBefore) {
    const DictionaryRef display = makeDictionary();
    display->set("Band", "GSM 900");
    display->set("State", "idle");
    const DictionaryRef foreign = makeDictionary();
    foreign->set("Band", 900);
    const std::vector<std::uint64_t> offsets = writeRecording(
        "ifx.pcapng", "IFX",
        {{at(0), serialized(display)}, {at(1), hex("00 01 02 03")}, {at(2), serialized(foreign)}});
    EXPECT_EQ(decode({path("ifx.pcapng")}), "Band   GSM 900\nState  idle\n");
    EXPECT_EQ(_errors, "velmora-log: " + path("ifx.pcapng") + ": record 2 at offset " +
                           std::to_string(offsets[1]) +
                           ": Could not deserialize the object (LogGenerator/GSM/GSMLogGenerator:90)\n"
                           "velmora-log: " +
                           path("ifx.pcapng") + ": record 3 at offset " + std::to_string(offsets[2]) +
                           ": Unknown object of type integer encountered "
                           "(LogGenerator/GSM/GSMLogGenerator:78)\n"
                           "velmora-log: " +
                           path("ifx.pcapng") + ": 2 messages could not be decoded\n");
}

TEST_F(UndecodedMessagesTest, FileOfNothingElseHasAnEmptyDisplay) {
    writeRecording("ifx.pcapng", "IFX", {{at(0), hex("00")}});
    EXPECT_EQ(decode({"--format", "json", path("ifx.pcapng")}),
              "{\n  \"technology\": \"IFX\",\n  \"messages\": 1,\n  \"display\": {}\n}\n");
    EXPECT_EQ(decode({"--format", "csv", "--select", "/A", path("ifx.pcapng")}),
              "time,/A\r\n2026-11-16T05:00:02.000000000Z,\r\n");
    EXPECT_EQ(decode({path("ifx.pcapng")}), "");
}

TEST_F(UndecodedMessagesTest, FirstHundredAreReportedOneByOne) {
    writeRecording("sim.pcapng", "Ostrel_GSM", std::vector<TimedMessage>(103, {at(0), _unreadableSim}));
    static_cast<void>(decode({path("sim.pcapng")}));
    EXPECT_EQ(std::count(_errors.begin(), _errors.end(), '\n'), 101);
    EXPECT_THAT(_errors, testing::EndsWith("velmora-log: " + path("sim.pcapng") +
                                           ": 103 messages could not be decoded\n"));
}

TEST_F(UndecodedMessagesTest, UnreadableSimFilesEndTheStrictProgramWithTheirMessage) {
    const std::vector<std::uint64_t> offsets = writeRecording(
        "sim.pcapng", "Ostrel_GSM",
        {{at(0), rrState(5)}, {at(1), record(0x0000, "DE AD BE EF", 0xFF)}, {at(2), rrState(4)}});
    writeRecording("drive.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}, {at(1000), rrState(5)}});
    ToolProcess process(tool({"decode", "--strict", path("drive.pcapng"), path("sim.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(), "== " + path("drive.pcapng") + " ==\n" +
                                    "GSM RR Info\n  RR State      RR_IDLE\n  RR Sub State  0\n"
                                    "  RR Status     1\n  RR Mode       Voice\nUMTS RR Info\nSIM Info\n");
    EXPECT_EQ(ownMessages(process.errors()), "velmora-log: " + path("sim.pcapng") + ": record 2 at offset " +
                                                 std::to_string(offsets[1]) +
                                                 ": SIM File dictionary data could not be constructed\n");
}

TEST_F(UndecodedMessagesTest, UnreadableSerializedObjectEndsTheStrictProgramWithItsMessage) {
    const std::vector<std::uint64_t> offsets =
        writeRecording("ifx.pcapng", "IFX", {{at(0), hex("00 01 02 03")}});
    ToolProcess process(tool({"decode", "--strict", path("ifx.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(), "");
    EXPECT_THAT(ownMessages(process.errors()),
                testing::StartsWith("velmora-log: " + path("ifx.pcapng") + ": record 1 at offset " +
                                    std::to_string(offsets[0]) + ": "));
}

TEST_F(UndecodedMessagesTest, ADecoderThatEndsTheProgramHasItsLinesSummedUpBefore) {
    const std::vector<std::uint64_t> offsets = writeRecording(
        "sim.pcapng", "Ostrel_GSM",
        {{at(0), record(0x512C, "04 00 01 00", 2)}, {at(1), record(0x0000, "DE AD BE EF", 0xFF)}});
    ToolProcess process(tool({"decode", "--strict", path("sim.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_THAT(process.errors(), testing::StartsWith("<3>Invalid log type: 2. Dropping.\n"));
    EXPECT_THAT(process.errors(), testing::EndsWith("velmora-log: " + path("sim.pcapng") +
                                                    ": record 2 at offset " + std::to_string(offsets[1]) +
                                                    ": SIM File dictionary data could not be constructed\n"));
}

} // namespace
} // namespace velmora
