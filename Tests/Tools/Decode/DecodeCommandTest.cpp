// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

#include <filesystem>

namespace velmora {
namespace {

using Json = nlohmann::ordered_json;
using testing::HasSubstr;

class DecodeCommandTest : public ToolTest {
protected:
    /// Two records of a GSM phone, a second apart.
    std::vector<std::uint64_t> writeDrive(const std::string& name) const {
        return writeRecording(name, "Ostrel_GSM", {{at(0), rrState(4)}, {at(1000), rrState(5)}});
    }
};

constexpr const char* idleText = "GSM RR Info\n"
                                 "  RR State      RR_IDLE\n"
                                 "  RR Sub State  0\n"
                                 "  RR Status     1\n"
                                 "  RR Mode       Voice\n"
                                 "UMTS RR Info\n"
                                 "SIM Info\n";

constexpr const char* idleJson = R"({
  "technology": "Ostrel_GSM",
  "messages": 2,
  "display": {
    "GSM RR Info": {
      "RR State": "RR_IDLE",
      "RR Sub State": "0",
      "RR Status": "1",
      "RR Mode": "Voice"
    },
    "UMTS RR Info": {},
    "SIM Info": {}
  }
}
)";

TEST_F(DecodeCommandTest, TextIsTheDisplayTreeAfterTheLastMessage) {
    writeDrive("drive.pcapng");
    ToolProcess process(tool({"decode", path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), idleText);
    EXPECT_EQ(ownMessages(process.errors()), "");
}

TEST_F(DecodeCommandTest, JsonIsOneObjectAndNothingElse) {
    writeDrive("drive.pcapng");
    ToolProcess process(tool({"decode", "--format", "json", path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), idleJson);
    EXPECT_EQ(Json::parse(process.output())["display"]["GSM RR Info"]["RR State"], "RR_IDLE");
}

TEST_F(DecodeCommandTest, JsonIsReadByAnotherParser) {
    const DictionaryRef odd = makeDictionary();
    odd->set("quote \" and backslash \\", "line\nfeed \xC3\xBC \xF0\x9F\x93\xA1");
    odd->set("rest", "");
    writeRecording("odd.pcapng", "IFX", {{at(0), serialized(odd)}});
    ToolProcess process(tool({"decode", "--format", "json", path("odd.pcapng")}));
    ASSERT_EQ(process.exitStatus(), 0);

    ToolProcess::Setup setup;
    setup.arguments = {"-m", "json.tool", "--compact", "--no-ensure-ascii"};
    setup.input = process.output();
    setup.environment = {{"PYTHONUTF8", "1"}, {"LD_PRELOAD", ""}};
    ToolProcess parser(setup, "/usr/bin/python3");
    EXPECT_EQ(parser.exitStatus(), 0) << parser.errors();
    EXPECT_EQ(parser.output(), "{\"technology\":\"IFX\",\"messages\":1,\"display\":{"
                               "\"quote \\\" and backslash \\\\\":\"line\\nfeed \xC3\xBC \xF0\x9F\x93\xA1\","
                               "\"rest\":\"\"}}\n");
}

TEST_F(DecodeCommandTest, SortedMarkersAndRawKeysStayInJsonAndShapeTheText) {
    const DictionaryRef cells = makeDictionary();
    cells->set("_sorted", "yes");
    cells->set("2;120", "-70 dBm");
    cells->set("1;87", "-80 dBm");
    const DictionaryRef display = makeDictionary();
    display->set("Cells", cells);
    display->set("Band", "GSM 900");
    writeRecording("ifx.pcapng", "IFX", {{at(0), serialized(display)}});

    ToolProcess json(tool({"decode", "--format", "json", path("ifx.pcapng")}));
    EXPECT_EQ(json.exitStatus(), 0);
    EXPECT_EQ(Json::parse(json.output()).dump(),
              R"({"technology":"IFX","messages":1,"display":{"Cells":{"_sorted":"yes","2;120":"-70 dBm",)"
              R"("1;87":"-80 dBm"},"Band":"GSM 900"}})");

    ToolProcess text(tool({"decode", path("ifx.pcapng")}));
    EXPECT_EQ(text.exitStatus(), 0);
    EXPECT_EQ(text.output(), "Cells\n"
                             "  87   -80 dBm\n"
                             "  120  -70 dBm\n"
                             "Band  GSM 900\n");
}

TEST_F(DecodeCommandTest, SeveralFilesAreHeadedInTextAndFollowEachOtherInJson) {
    writeDrive("a.pcapng");
    writeDrive("b.pcapng");
    ToolProcess text(tool({"decode", path("a.pcapng"), path("b.pcapng")}));
    EXPECT_EQ(text.exitStatus(), 0);
    EXPECT_EQ(text.output(), "== " + path("a.pcapng") + " ==\n" + idleText + "\n== " + path("b.pcapng") +
                                 " ==\n" + idleText);
    ToolProcess json(tool({"decode", path("a.pcapng"), "--format=json", path("b.pcapng")}));
    EXPECT_EQ(json.exitStatus(), 0);
    EXPECT_EQ(json.output(), std::string(idleJson) + idleJson);
}

TEST_F(DecodeCommandTest, DashIsStandardInput) {
    writeDrive("drive.pcapng");
    ToolProcess::Setup setup = tool({"decode", "-"});
    setup.input = contentOf("drive.pcapng");
    ToolProcess process(setup);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), idleText);
}

TEST_F(DecodeCommandTest, RecordingWithoutMessagesHasAnEmptyDisplay) {
    writeRecording("empty.pcapng", "Ostrel_GSM", {});
    ToolProcess json(tool({"decode", "--format", "json", path("empty.pcapng")}));
    EXPECT_EQ(json.exitStatus(), 0);
    EXPECT_EQ(json.output(),
              "{\n  \"technology\": \"Ostrel_GSM\",\n  \"messages\": 0,\n  \"display\": {}\n}\n");
    ToolProcess text(tool({"decode", path("empty.pcapng")}));
    EXPECT_EQ(text.exitStatus(), 0);
    EXPECT_EQ(text.output(), "");
}

TEST_F(DecodeCommandTest, TechnologyOptionOverridesTheFile) {
    writeRecording("a.pcapng", "Nonesuch", {{at(0), rrState(4)}, {at(0), rrState(5)}});
    for (const char* name : {"Ostrel_GSM", "kVoxLogChannelTechnology_Ostrel_GSM", "GSM", "gsm"}) {
        ToolProcess process(tool({"decode", "--format", "json", "--technology", name, path("a.pcapng")}));
        EXPECT_EQ(process.exitStatus(), 0);
        EXPECT_EQ(process.output(), idleJson) << name;
    }
}

TEST_F(DecodeCommandTest, UnknownOrMissingTechnologyIsReportedWithTheValidOnes) {
    constexpr const char* names =
        "wanted one of IFX, Ostrel_GSM, Ostrel_CDMA, Ostrel_LTE, Ostrel_UTRAN2, Modem";
    writeRecording("none.pcapng", "", {{at(0), rrState(5)}});
    writeRecording("other.pcapng", "Nonesuch", {{at(0), rrState(5)}});
    struct Case {
        std::vector<std::string> arguments;
        std::string message;
    };
    const Case cases[] = {
        {{"decode", path("none.pcapng")},
         path("none.pcapng") + ": names no technology, " + names + "; --technology supplies it"},
        {{"decode", path("other.pcapng")},
         path("other.pcapng") + ": technology \"Nonesuch\" is unknown, " + names},
    };
    for (const Case& row : cases) {
        ToolProcess process(tool(row.arguments));
        EXPECT_EQ(process.exitStatus(), 1);
        EXPECT_EQ(process.output(), "");
        EXPECT_EQ(ownMessages(process.errors()), "velmora-log: " + row.message + "\n");
    }
}

TEST_F(DecodeCommandTest, FileThatIsNotThereDoesNotKeepTheOthersFromBeingDecoded) {
    writeDrive("drive.pcapng");
    ToolProcess process(tool({"decode", "--format", "json", path("gone.pcapng"), path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(), idleJson);
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: " + path("gone.pcapng") + ": cannot open: No such file or directory\n");
}

TEST_F(DecodeCommandTest, FileThatIsNoRecordingIsRefused) {
    ToolProcess::Setup setup = tool({"decode", "-"});
    setup.input = "";
    ToolProcess process(setup);
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(), "");
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: standard input: empty, wanted a recording, a snapshot or a DLF log\n");
}

TEST_F(DecodeCommandTest, UnreadableTemplateIsReported) {
    writeDrive("drive.pcapng");
    const std::string place = path("resources/Ostrel_GSM.plist");
    std::filesystem::remove(place);
    std::filesystem::create_directory(place);
    ToolProcess process(tool({"decode", path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(), "");
    EXPECT_EQ(ownMessages(process.errors()), "velmora-log: " + path("drive.pcapng") +
                                                 ": decoded without its template: " + place +
                                                 ": cannot be read: Is a directory\n");
}

TEST_F(DecodeCommandTest, RecordingCutOffIsDecodedUpToThere) {
    const std::vector<std::uint64_t> offsets = writeRecording(
        "cut.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}, {at(1000), rrState(5)}, {at(2000), rrState(4)}});
    std::filesystem::resize_file(path("cut.pcapng"), offsets[3] - 10);
    ToolProcess process(tool({"decode", "--format", "json", path("cut.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(), idleJson);
    const std::uint64_t length = offsets[3] - offsets[2];
    EXPECT_EQ(ownMessages(process.errors()), "velmora-log: " + path("cut.pcapng") + ": record 3 at offset " +
                                                 std::to_string(offsets[2]) + ": block cut off after " +
                                                 std::to_string(length - 10) + " of " +
                                                 std::to_string(length) + " bytes\n");
}

TEST_F(DecodeCommandTest, RecordsThatDecodersDropAreNoBadInput) {
    // They are what the modem sent: an unknown type byte, and fewer bytes than a header has.
    writeRecording("odd.pcapng", "Ostrel_GSM",
                   {{at(0), rrState(5)}, {at(1), record(0x512C, "04 00 01 00", 2)}});
    ToolProcess process(tool({"decode", path("odd.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), idleText);
    EXPECT_THAT(process.errors(), HasSubstr("<3>Invalid log type: 2. Dropping.\n"));
}

TEST_F(DecodeCommandTest, ClosedPipeEndsItQuietly) {
    // More than a pipe holds, so that writing meets the closed end.
    const DictionaryRef display = makeDictionary();
    for (int i = 0; i < 20'000; ++i)
        display->set("Row " + std::to_string(i), "a value");
    writeRecording("long.pcapng", "IFX", {{at(0), serialized(display)}});
    ToolProcess process(tool({"decode", path("long.pcapng"), path("long.pcapng")}));
    process.stopReading();
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(ownMessages(process.errors()), "");
}

TEST_F(DecodeCommandTest, FullDiskIsReported) {
    writeDrive("drive.pcapng");
    ToolProcess::Setup setup = tool({"decode", path("drive.pcapng")});
    setup.outputFile = "/dev/full";
    ToolProcess process(setup);
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: cannot write standard output: No space left on device\n");
}

TEST_F(DecodeCommandTest, ClosedStandardOutputIsAsDevNull) {
    writeDrive("drive.pcapng");
    ToolProcess process(
        tool({"-c", "exec \"$0\" decode \"$1\" >&-", VELMORA_BUILD_DIR "/velmora-log", path("drive.pcapng")}),
        "/bin/sh");
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(ownMessages(process.errors()), "");
}

TEST_F(DecodeCommandTest, DecoderLinesAreSummedUpUnlessVerbose) {
    // A type of 2 is dropped with a line.
    writeRecording("odd.pcapng", "Ostrel_GSM",
                   {{at(0), record(0x512C, "04 00 01 00", 2)}, {at(1), record(0x512C, "04 00 01 00", 2)}});
    writeDrive("drive.pcapng");
    ToolProcess sums(tool({"decode", path("odd.pcapng")}));
    EXPECT_EQ(sums.exitStatus(), 0);
    EXPECT_EQ(sums.errors(), "<3>2 times: Invalid log type: 2. Dropping.\n");
    ToolProcess lines(tool({"decode", "--verbose", path("odd.pcapng")}));
    EXPECT_EQ(lines.exitStatus(), 0);
    EXPECT_THAT(lines.errors(),
                testing::MatchesRegex("<3>Creating Ostrel_GSMLogGenerator object\n"
                                      "<3>Creating OstrelLogGenerator2 object with 0x[0-9a-f]+\n"
                                      "<3>Class Index: 1\n"
                                      "<3>Invalid log type: 2. Dropping.\n"
                                      "<3>Invalid log type: 2. Dropping.\n"
                                      "Deallocing Ostrel_GSMClassIndex\n"
                                      "Deallocing ClassIndex\n"));
    // With several files each sum names its file, whether or not processes share the work.
    const std::string both = "<3>" + path("odd.pcapng") + ": 2 times: Invalid log type: 2. Dropping.\n";
    for (const char* const jobs : {"1", "2"}) {
        ToolProcess several(tool({"decode", "--jobs", jobs, path("odd.pcapng"), path("drive.pcapng")}));
        EXPECT_EQ(several.exitStatus(), 0);
        EXPECT_EQ(several.errors(), both) << jobs;
    }
}

TEST_F(DecodeCommandTest, LogLevelDecidesWhichLinesAreWritten) {
    writeDrive("drive.pcapng");
    ToolProcess quiet(tool({"--log-level", "0", "decode", path("drive.pcapng")}));
    EXPECT_EQ(quiet.exitStatus(), 0);
    EXPECT_EQ(quiet.errors().find('<'), std::string::npos) << quiet.errors();
    ToolProcess loud(tool({"decode", path("drive.pcapng"), "-v", "--log-level", "4", "--log", "stderr"}));
    EXPECT_EQ(loud.exitStatus(), 0);
    EXPECT_THAT(loud.errors(), HasSubstr("<4>GSMRRInfo\n"));
    EXPECT_EQ(loud.output(), idleText);
}

} // namespace
} // namespace velmora
