// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/PropertyList.h"
#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <fstream>

#include <sys/stat.h>

// What `decode` prints line by line.

namespace velmora {
namespace {

using testing::HasSubstr;
using testing::StartsWith;

class DecodeLinesTest : public ToolTest {
protected:
    /// A GSM phone's records, of which the second is short, the third of no stream, the fourth unknown.
    void writeDrive(const std::string& name) const {
        writeRecording(name, "Ostrel_GSM",
                       {{at(0), rrState(4)},
                        {at(500), hex("01 02 03")},
                        {at(1000), record(0x512C, "05 00 01 00", 2)},
                        {at(1500), record(0x1234, "")},
                        {at(2000), rrState(5)}});
    }

    /// Standard output of a run that ends with 0 and says nothing itself.
    [[nodiscard]] std::string decode(std::vector<std::string> arguments) const {
        arguments.insert(arguments.begin(), "decode");
        ToolProcess process(tool(std::move(arguments)));
        EXPECT_EQ(process.exitStatus(), 0);
        EXPECT_EQ(ownWords(process.errors()), "");
        return process.output();
    }

    /// So many MiB of messages that no section wants.
    void writeLargeRecording(const std::string& name, std::size_t mebibytes) const {
        const Data message(std::vector<std::uint8_t>(std::size_t{1} << 20, 0x01));
        writeRecording(name, "Ostrel_GSM", std::vector<TimedMessage>(mebibytes, {at(0), message}));
    }
};

constexpr const char* firstRefresh =
    R"("time":"2026-11-16T05:00:02.000000000Z","technology":"Ostrel_GSM","messages":4,)"
    R"("display":{"GSM RR Info":{"RR State":"RR_PLMN_LIST_CONSTRUCTION","RR Sub State":"0","RR Status":"1",)"
    R"("RR Mode":"Voice"},"UMTS RR Info":{},"SIM Info":{}}})";
constexpr const char* secondRefresh =
    R"("time":"2026-11-16T05:00:04.000000000Z","technology":"Ostrel_GSM","messages":5,)"
    R"("display":{"GSM RR Info":{"RR State":"RR_IDLE","RR Sub State":"0","RR Status":"1",)"
    R"("RR Mode":"Voice"},"UMTS RR Info":{},"SIM Info":{}}})";

TEST_F(DecodeLinesTest, JsonlIsAnObjectForEachRefresh) {
    writeDrive("a.pcapng");
    EXPECT_EQ(decode({"--format", "jsonl", path("a.pcapng")}),
              std::string("{") + firstRefresh + "\n{" + secondRefresh + "\n");
}

TEST_F(DecodeLinesTest, SeveralFilesAreNamedInEachObject) {
    writeDrive("a.pcapng");
    writeDrive("b.pcapng");
    const std::string a = "{\"file\":\"" + path("a.pcapng") + "\",";
    const std::string b = "{\"file\":\"" + path("b.pcapng") + "\",";
    EXPECT_EQ(decode({"--format", "jsonl", path("a.pcapng"), path("b.pcapng")}),
              a + firstRefresh + "\n" + a + secondRefresh + "\n" + b + firstRefresh + "\n" + b +
                  secondRefresh + "\n");
}

TEST_F(DecodeLinesTest, EveryMessageOfSectionsHasThoseThatWantItsCode) {
    writeDrive("a.pcapng");
    EXPECT_EQ(
        decode({"--format", "jsonl", "--every", "message", path("a.pcapng"), "--log-level", "0"}),
        R"({"time":"2026-11-16T05:00:00.000000000Z","code":20780,"sections":{"GSM RR Info":{)"
        R"("RR State":"RR_PLMN_LIST_CONSTRUCTION","RR Sub State":"0","RR Status":"1","RR Mode":"Voice"}}})"
        "\n"
        R"({"time":"2026-11-16T05:00:00.500000000Z","code":null,"sections":{}})"
        "\n"
        R"({"time":"2026-11-16T05:00:01.000000000Z","code":null,"sections":{}})"
        "\n"
        R"({"time":"2026-11-16T05:00:01.500000000Z","code":4660,"sections":{}})"
        "\n"
        R"({"time":"2026-11-16T05:00:02.000000000Z","code":20780,"sections":{"GSM RR Info":{)"
        R"("RR State":"RR_IDLE","RR Sub State":"0","RR Status":"1","RR Mode":"Voice"}}})"
        "\n");
}

TEST_F(DecodeLinesTest, EveryMessageOfValuesHasThoseThatItPublished) {
    ToolProcess::Setup setup = tool({"decode", "--format", "jsonl", "--every", "message", path("c.pcapng")});
    setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources";
    writeRecording("c.pcapng", "Ostrel_CDMA",
                   {{at(0), record(0x108A, "00 00 00 00 00 00 00 00 00 00")}, // no finger
                    {at(1), record(0x108A, "00")},                            // too short for its parser
                    {at(2), hex("01")}});
    ToolProcess process(setup);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(),
              R"-({"time":"2026-11-16T05:00:00.000000000Z","code":4234,"values":{"kFingerC2I":"(none)"}})-"
              "\n"
              R"({"time":"2026-11-16T05:00:00.001000000Z","code":4234,"values":{}})"
              "\n"
              R"({"time":"2026-11-16T05:00:00.002000000Z","code":null,"values":{}})"
              "\n");
}

TEST_F(DecodeLinesTest, EveryMessageOfSerializedObjectsHasTheDisplay) {
    const DictionaryRef display = makeDictionary();
    display->set("Band", "GSM \"900\"");
    display->set("Cell\n", "\x01\\");
    writeRecording("i.pcapng", "IFX",
                   {{at(0), serialized(makeDictionary())}, {at(1), Data(*writeBinaryPropertyList(display))}});
    EXPECT_EQ(
        decode({"--format", "jsonl", "--every", "message", path("i.pcapng")}),
        R"({"time":"2026-11-16T05:00:00.000000000Z","display":{}})"
        "\n"
        R"({"time":"2026-11-16T05:00:00.001000000Z","display":{"Band":"GSM \"900\"","Cell\n":"\u0001\\"}})"
        "\n");
}

TEST_F(DecodeLinesTest, CsvHasARowForEachRefreshAndACellForEachPath) {
    writeDrive("a.pcapng");
    EXPECT_EQ(decode({"--format", "csv", "--select", "/GSM RR Info/RR State", "--select",
                      "/No, such/\"path\"", path("a.pcapng"), "--select", "/UMTS RR Info"}),
              "time,/GSM RR Info/RR State,\"/No, such/\"\"path\"\"\",/UMTS RR Info\r\n"
              "2026-11-16T05:00:02.000000000Z,RR_PLMN_LIST_CONSTRUCTION,,{}\r\n"
              "2026-11-16T05:00:04.000000000Z,RR_IDLE,,{}\r\n");
}

TEST_F(DecodeLinesTest, CsvOfSeveralFilesHasAColumnForThem) {
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

TEST_F(DecodeLinesTest, CsvMayHaveARowForEachMessage) {
    writeDrive("a.pcapng");
    EXPECT_EQ(decode({"--format", "csv", "--every", "message", "--select", "/GSM RR Info/RR State", "--from",
                      "2026-11-16T05:00:01.5Z", path("a.pcapng")}),
              "time,/GSM RR Info/RR State\r\n"
              "2026-11-16T05:00:01.500000000Z,\r\n" // the message that set it lies outside
              "2026-11-16T05:00:02.000000000Z,RR_IDLE\r\n");
}

TEST_F(DecodeLinesTest, SelectionRestrictsEveryFormat) {
    writeDrive("a.pcapng");
    const std::string select = "/GSM RR Info/RR State";
    EXPECT_EQ(decode({"--select", select, path("a.pcapng")}), "GSM RR Info\n  RR State  RR_IDLE\n");
    EXPECT_EQ(decode({"--format", "json", "--select", select, path("a.pcapng")}),
              "{\n  \"technology\": \"Ostrel_GSM\",\n  \"messages\": 5,\n  \"display\": {\n"
              "    \"GSM RR Info\": {\n      \"RR State\": \"RR_IDLE\"\n    }\n  }\n}\n");
    EXPECT_EQ(decode({"--format", "jsonl", "--select", select, "--from", "+2", path("a.pcapng")}),
              R"({"time":"2026-11-16T05:00:04.000000000Z","technology":"Ostrel_GSM","messages":1,)"
              R"("display":{"GSM RR Info":{"RR State":"RR_IDLE"}}})"
              "\n");
    EXPECT_EQ(decode({"--select", "/Nothing", path("a.pcapng")}), "");
}

TEST_F(DecodeLinesTest, LinesBeforeAFailureOfTheDecoderAreWhole) {
    const std::vector<std::uint64_t> offsets = writeRecording(
        "sim.pcapng", "Ostrel_GSM", {{at(0), rrState(5)}, {at(1), record(0x0000, "DE AD BE EF", 0xFF)}});
    ToolProcess process(tool({"decode", "--format", "jsonl", "--every", "message", path("sim.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(),
              R"({"time":"2026-11-16T05:00:00.000000000Z","code":20780,"sections":{"GSM RR Info":{)"
              R"("RR State":"RR_IDLE","RR Sub State":"0","RR Status":"1","RR Mode":"Voice"}}})"
              "\n");
    EXPECT_EQ(ownWords(process.errors()), "velmora-log: " + path("sim.pcapng") + ": record 2 at offset " +
                                              std::to_string(offsets[1]) +
                                              ": SIM File dictionary data could not be constructed\n");
}

TEST_F(DecodeLinesTest, LinesOfAPipeComeWithEachRefresh) {
    writeDrive("a.pcapng");
    ASSERT_EQ(::mkfifo(path("pipe").c_str(), 0600), 0);
    ToolProcess process(tool({"decode", "--format", "jsonl", path("pipe")}));
    std::ofstream pipe(path("pipe"), std::ios::binary); // once the program has opened it
    pipe << contentOf("a.pcapng") << std::flush;
    EXPECT_TRUE(process.waitFor(std::string("{") + firstRefresh + "\n"));
    pipe.close();
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), std::string("{") + firstRefresh + "\n{" + secondRefresh + "\n");
}

TEST_F(DecodeLinesTest, FullDiskIsTold) {
    writeDrive("a.pcapng");
    for (const std::vector<std::string>& format :
         {std::vector<std::string>{"--format", "jsonl"}, {"--format", "csv", "--select", "/SIM Info"}}) {
        std::vector<std::string> arguments = {"decode", path("a.pcapng"), path("a.pcapng"), "--jobs", "2"};
        arguments.insert(arguments.end(), format.begin(), format.end());
        ToolProcess::Setup setup = tool(arguments);
        setup.outputFile = "/dev/full";
        ToolProcess process(setup);
        EXPECT_EQ(process.exitStatus(), 1);
        EXPECT_EQ(ownWords(process.errors()),
                  "velmora-log: cannot write standard output: No space left on device\n");
    }
}

TEST_F(DecodeLinesTest, ClosedPipeEndsItEarlyAndQuietly) {
    // Far more than a pipe holds.
    writeRecording("long.pcapng", "Ostrel_GSM", std::vector<TimedMessage>(50'000, {at(0), rrState(5)}));
    for (const char* jobs : {"1", "2"}) {
        ToolProcess process(tool({"decode", "--format", "jsonl", "--every", "message", "--jobs", jobs,
                                  path("long.pcapng"), path("long.pcapng")}));
        ASSERT_TRUE(process.waitFor("\n"));
        process.stopReading();
        EXPECT_EQ(process.exitStatus(), 0);
        EXPECT_EQ(ownWords(process.errors()), "");
    }
}

TEST_F(DecodeLinesTest, JobsPrintWhatOneAfterTheOtherPrints) {
    writeDrive("a.pcapng");
    writeRecording("empty.pcapng", "Ostrel_GSM", {});
    // More than a pipe holds, at both ends of the row.
    writeRecording("long.pcapng", "Ostrel_GSM", std::vector<TimedMessage>(20'000, {at(0), rrState(5)}));
    const std::vector<std::string> files = {path("long.pcapng"),  path("a.pcapng"), path("gone.pcapng"),
                                            path("empty.pcapng"), path("a.pcapng"), path("long.pcapng")};
    for (const std::vector<std::string>& format :
         {std::vector<std::string>{"--format", "jsonl", "--every", "message"},
          {"--format", "json"},
          {"--format", "csv", "--every", "message", "--select", "/GSM RR Info/RR State"},
          {}}) {
        std::vector<std::string> arguments = {"decode", "--log-level", "0"};
        arguments.insert(arguments.end(), format.begin(), format.end());
        arguments.insert(arguments.end(), files.begin(), files.end());
        ToolProcess serial(tool(arguments));
        EXPECT_EQ(serial.exitStatus(), 1);
        for (const char* jobs : {"2", "5", "100"}) {
            arguments.emplace_back("--jobs");
            arguments.emplace_back(jobs);
            ToolProcess side(tool(arguments));
            arguments.resize(arguments.size() - 2);
            EXPECT_EQ(side.exitStatus(), 1);
            EXPECT_TRUE(side.output() == serial.output()) << jobs << " jobs";
            EXPECT_EQ(ownWords(side.errors()),
                      "velmora-log: " + path("gone.pcapng") + ": cannot open: No such file or directory\n");
        }
        EXPECT_EQ(ownWords(serial.errors()),
                  "velmora-log: " + path("gone.pcapng") + ": cannot open: No such file or directory\n");
    }
}

TEST_F(DecodeLinesTest, JobsGoWithoutADirectoryForTemporaryFiles) {
    writeRecording("long.pcapng", "Ostrel_GSM", std::vector<TimedMessage>(5'000, {at(0), rrState(5)}));
    ToolProcess::Setup setup = tool({"decode", "--format", "jsonl", "--every", "message", path("long.pcapng"),
                                     path("long.pcapng"), path("long.pcapng")});
    ToolProcess serial(setup);
    EXPECT_EQ(serial.exitStatus(), 0);
    setup.arguments.insert(setup.arguments.end(), {"--jobs", "3"});
    setup.environment["TMPDIR"] = path("no such directory");
    ToolProcess side(setup);
    EXPECT_EQ(side.exitStatus(), 0);
    EXPECT_TRUE(side.output() == serial.output());
}

TEST_F(DecodeLinesTest, JobThatADecoderEndsEndsThoseBehindIt) {
    writeDrive("a.pcapng");
    const std::vector<std::uint64_t> offsets =
        writeRecording("sim.pcapng", "Ostrel_GSM", {{at(0), record(0x0000, "DE AD BE EF", 0xFF)}});
    ToolProcess process(tool({"decode", "--jobs", "3", "--log-level", "0", "--format", "csv", "--select", "/",
                              path("a.pcapng"), path("sim.pcapng"), path("a.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_THAT(process.output(), StartsWith("time,file,/\r\n2026-11-16T05:00:02.000000000Z," +
                                             path("a.pcapng") + ",\"{\"\"GSM RR Info"));
    EXPECT_EQ(std::count(process.output().begin(), process.output().end(), '\r'), 3);
    EXPECT_EQ(ownWords(process.errors()), "velmora-log: " + path("sim.pcapng") + ": record 1 at offset " +
                                              std::to_string(offsets[0]) +
                                              ": SIM File dictionary data could not be constructed\n");
}

TEST_F(DecodeLinesTest, StandardInputTwiceIsReadInTurn) {
    writeDrive("a.pcapng");
    ToolProcess::Setup setup = tool({"decode", "--format", "jsonl", "--jobs", "2", "-", "-"});
    setup.input = contentOf("a.pcapng");
    ToolProcess process(setup);
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(),
              std::string("{\"file\":\"-\",") + firstRefresh + "\n{\"file\":\"-\"," + secondRefresh + "\n");
    EXPECT_THAT(ownWords(process.errors()), StartsWith("velmora-log: standard input: empty"));
}

TEST_F(DecodeLinesTest, ProgressOfLongInputShowsOnATerminalAlone) {
    writeLargeRecording("long.pcapng", 65);
    writeLargeRecording("short.pcapng", 63);
    constexpr const char* shown = "0 %";
    constexpr const char* cleared = "\r\x1b[K";
    const auto errorsOf = [this](const std::string& file, bool onTerminal) {
        ToolProcess::Setup setup = tool({"decode", "--format", "csv", "--select", "/", path(file)});
        setup.errorsOnTerminal = onTerminal;
        ToolProcess process(setup);
        EXPECT_EQ(process.exitStatus(), 0);
        return process.errors();
    };
    const std::string errors = errorsOf("long.pcapng", true);
    EXPECT_THAT(errors, HasSubstr(shown));
    const std::size_t last = errors.rfind(" %");
    EXPECT_NE(errors.find(cleared, last), std::string::npos) << errors;
    EXPECT_EQ(errorsOf("long.pcapng", false).find(shown), std::string::npos);
    EXPECT_EQ(errorsOf("short.pcapng", true).find(shown), std::string::npos);
}

} // namespace
} // namespace velmora
