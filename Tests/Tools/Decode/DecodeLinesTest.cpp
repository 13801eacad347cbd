// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/PropertyList.h"
#include "Tests/Tools/Decode/DecodeLinesFixture.h"

#include <fstream>

#include <sys/stat.h>

// What `decode` prints line by line.

namespace velmora {
namespace {

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
    // A place that the display can have, and has not.
    EXPECT_EQ(decode({"--select", "/SIM Info/EF-LOCI", path("a.pcapng")}), "");
}

TEST_F(DecodeLinesTest, LinesBeforeADecoderEndsAreComplete) {
    const std::vector<std::uint64_t> offsets = writeRecording(
        "sim.pcapng", "Ostrel_GSM", {{at(0), rrState(5)}, {at(1), record(0x0000, "DE AD BE EF", 0xFF)}});
    ToolProcess process(
        tool({"decode", "--strict", "--format", "jsonl", "--every", "message", path("sim.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(),
              R"({"time":"2026-11-16T05:00:00.000000000Z","code":20780,"sections":{"GSM RR Info":{)"
              R"("RR State":"RR_IDLE","RR Sub State":"0","RR Status":"1","RR Mode":"Voice"}}})"
              "\n");
    EXPECT_EQ(ownMessages(process.errors()), "velmora-log: " + path("sim.pcapng") + ": record 2 at offset " +
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

TEST_F(DecodeLinesTest, LinesOfAPipeComeWithEachMessage) {
    const std::vector<std::uint64_t> offsets =
        writeRecording("a.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}, {at(10), rrState(5)}});
    const std::string content = contentOf("a.pcapng");
    ASSERT_EQ(::mkfifo(path("pipe").c_str(), 0600), 0);
    for (const std::vector<std::string>& format :
         {std::vector<std::string>{"--format", "jsonl"},
          {"--format", "csv", "--select", "/GSM RR Info/RR State"}}) {
        std::vector<std::string> arguments = {"decode", "--every", "message", path("pipe")};
        arguments.insert(arguments.end(), format.begin(), format.end());
        ToolProcess process(tool(arguments));
        std::ofstream pipe(path("pipe"), std::ios::binary);
        pipe << content.substr(0, offsets[1]) << std::flush;
        // Nothing more comes before the line is out.
        EXPECT_TRUE(process.waitFor("RR_PLMN_LIST_CONSTRUCTION"));
        EXPECT_TRUE(process.waitFor("\n"));
        pipe << content.substr(offsets[1]) << std::flush;
        EXPECT_TRUE(process.waitFor("RR_IDLE"));
        pipe.close();
        EXPECT_EQ(process.exitStatus(), 0);
    }
}

TEST_F(DecodeLinesTest, FullDiskIsReported) {
    writeDrive("a.pcapng");
    for (const std::vector<std::string>& format :
         {std::vector<std::string>{"--format", "jsonl"}, {"--format", "csv", "--select", "/SIM Info"}}) {
        std::vector<std::string> arguments = {"decode", path("a.pcapng"), path("a.pcapng"), "--jobs", "2"};
        arguments.insert(arguments.end(), format.begin(), format.end());
        ToolProcess::Setup setup = tool(arguments);
        setup.outputFile = "/dev/full";
        ToolProcess process(setup);
        EXPECT_EQ(process.exitStatus(), 1);
        EXPECT_EQ(ownMessages(process.errors()),
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
        EXPECT_EQ(ownMessages(process.errors()), "");
    }
}

} // namespace
} // namespace velmora
