// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recording/PcapngFile.h"
#include "Tests/Support/ShellCommand.h"
#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <filesystem>
#include <fstream>
#include <string>
#include <utility>
#include <vector>

namespace velmora {
namespace {

class InfoCommandTest : public ToolTest {};

TEST_F(InfoCommandTest, CountsMessagesByLogCodeWithTheirSections) {
    const std::vector<std::uint64_t> offsets =
        writeRecording("drive.pcapng", "Ostrel_GSM",
                       {
                           {at(1250), rrState(4)},                                 // 17 bytes
                           {at(0), rrState(5)},                                    // 17, the earliest
                           {at(3600'001), joined(hex("81 00"), rrState(5))},       // 19, the latest
                           {at(1300), record(0x1234, "")},                         // 13, without subscriber
                           {at(1400), extraRecord(0, makeDictionary())},           // SIM files
                           {at(1500), hex("01 02 03")},                            // 3, too short
                           {at(1600), record(0x512C, "00", 2)},                    // 14, of no known type
                           {at(1700), hex("01 02 03 04 05 06 07 08 09 0A 0B 0C")}, // 12, too short
                       });
    const std::size_t simSize = extraRecord(0, makeDictionary()).size();
    ToolProcess process(tool({"info", path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), "form:       recording\n"
                                "technology: Ostrel_GSM\n"
                                "first:      2026-11-16 05:00:00.000 UTC\n"
                                "last:       2026-11-16 06:00:00.001 UTC\n"
                                "duration:   3600.001 s\n"
                                "messages:   8\n"
                                "bytes:      " +
                                    std::to_string(95 + simSize) +
                                    "\n"
                                    "prefixed:   1 (first: record 3 at offset " +
                                    std::to_string(offsets[2]) +
                                    ")\n"
                                    "too short:  2 (first: record 6 at offset " +
                                    std::to_string(offsets[5]) +
                                    ")\n"
                                    "wrong type: 1 (first: record 7 at offset " +
                                    std::to_string(offsets[6]) +
                                    ")\n"
                                    "lost:       0\n"
                                    "\n"
                                    "    code     messages  sections\n"
                                    "  0x1234            1  -\n"
                                    "  0x512C            3  GSM RR Info\n"
                                    "0xFF0000            1  SIM Info\n");
    EXPECT_EQ(ownMessages(process.errors()), "");
}

/// What a terminal may not get: all control characters but the line feed, of both sets, and what turns or
/// hides text.
std::vector<std::string> hostileTexts() {
    return {"\x1b",   "\x07",   "\x7f",   "\r",     "\t",        "\u009B",
            "\u200F", "\u202E", "\u061C", "\uFEFF", "\U000E0041"};
}

TEST_F(InfoCommandTest, AHostileFileControlsNoTerminal) {
    std::string hostile = "a\n==";
    for (const std::string& text : hostileTexts())
        hostile += text + "[2J";
    for (int i = 0; i < 20; ++i)
        hostile += "\u0301";
    const Data bytes(std::vector<std::uint8_t>(hostile.begin(), hostile.end()));
    // The interface's name and comments, a packet's comment, and a link type that is passed over.
    PcapngFile file;
    const Data options =
        joined(file.option(2, bytes.bytes()), file.option(1, bytes.bytes()), file.option(3, bytes.bytes()));
    file.section().interface(147, options.bytes()).interface(1, options.bytes());
    file.message(1, rrState(5).bytes()).message(2, bytes.bytes());
    const std::string path = this->path("hostile " + hostile.substr(0, 60) + ".pcapng");
    std::ofstream(path, std::ios::binary) << std::string(file.bytes().begin(), file.bytes().end());
    const std::string missing = path + "?";
    for (const std::vector<std::string>& arguments : std::vector<std::vector<std::string>>{
             {"info", path, path, missing},
             {"decode", path, path},
             {"-v", "decode", "--technology", "GSM", path, missing},
             {"decode", "--technology", "IFX", path},
             {"convert", path, missing},
             {"decode", "--select", "/" + hostile, "--technology", "GSM", path},
             {"decode", "--format", hostile, path},
             {"--" + hostile},
         }) {
        ToolProcess process(tool(arguments));
        static_cast<void>(process.exitStatus());
        const std::string shown = process.output() + process.errors();
        EXPECT_THAT(shown, testing::HasSubstr("\\x1B[2J")) << arguments[0];
        for (const std::string& text : hostileTexts())
            EXPECT_EQ(shown.find(text), std::string::npos)
                << arguments[0] << ": " << testing::PrintToString(text);
        EXPECT_EQ(shown.find("a\n=="), std::string::npos) << "a line of its own";
        EXPECT_THAT(shown, testing::Not(
                               testing::HasSubstr("\u0301\u0301\u0301\u0301\u0301\u0301\u0301\u0301\u0301")));
    }
}

TEST_F(InfoCommandTest, ASnapshotsDescriptionIsShown) {
    writeRecording("drive.pcapng", "Ostrel_GSM", {{at(0), rrState(5)}});
    // XML cannot hold an escape character, the binary form can.
    ToolProcess made(
        tool({"convert", "--description", "gate 4,\nroof\x1b", path("drive.pcapng"), path("drive.velmora")}));
    ASSERT_EQ(made.exitStatus(), 0);
    ToolProcess process(tool({"info", path("drive.velmora")}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(process.output(), testing::HasSubstr("lost:       0\ndescribed:  gate 4,\\nroof\\x1B\n\n"));
    EXPECT_THAT(process.output(), testing::Not(testing::HasSubstr("comments:")));
}

TEST_F(InfoCommandTest, GzippedFilesAreListedAsWhatTheyUnpackTo) {
    NEEDS_PROGRAM("gzip");
    writeRecording("drive.pcapng", "Ostrel_GSM", {{at(0), rrState(5)}, {at(1), hex("01 02 03")}});
    ASSERT_EQ(runShell("gzip -k " + path("drive.pcapng")).status, 0);
    ToolProcess plain(tool({"info", path("drive.pcapng")}));
    ToolProcess process(tool({"info", path("drive.pcapng.gz")}));
    EXPECT_EQ(plain.exitStatus(), 0);
    EXPECT_EQ(process.exitStatus(), 0);
    const std::string form = "form:       recording";
    ASSERT_THAT(plain.output(), testing::StartsWith(form + "\n"));
    EXPECT_EQ(process.output(), form + ", gzip'd" + plain.output().substr(form.size()));
    // What is cut is named, and what comes before is listed.
    ASSERT_EQ(runShell("head -c -3 " + path("drive.pcapng.gz") + " > " + path("cut.gz")).status, 0);
    ToolProcess cut(tool({"info", path("cut.gz")}));
    EXPECT_EQ(cut.exitStatus(), 1);
    EXPECT_EQ(cut.output(), process.output());
    EXPECT_THAT(cut.errors(), testing::StartsWith("velmora-log: " + path("cut.gz") +
                                                  ": gzip'd data that ends early, at byte "));
}

TEST_F(InfoCommandTest, SerializedObjectsHaveNoLogCodes) {
    const Data message = serialized("idle");
    writeRecording("ifx.pcapng", "IFX", {{at(0), message}});
    ToolProcess process(tool({"info", path("ifx.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), "form:       recording\n"
                                "technology: IFX\n"
                                "first:      2026-11-16 05:00:00.000 UTC\n"
                                "last:       2026-11-16 05:00:00.000 UTC\n"
                                "duration:   0.000 s\n"
                                "messages:   1\n"
                                "bytes:      " +
                                    std::to_string(message.size()) + "\nlost:       0\n");
}

TEST_F(InfoCommandTest, LossIsShownAndMakesTheInputBad) {
    const std::vector<std::uint64_t> offsets =
        writeRecording("cut.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}, {at(500), rrState(5)}});
    std::filesystem::resize_file(path("cut.pcapng"), offsets[2] - 6);
    const std::uint64_t length = offsets[2] - offsets[1];
    const std::string place = "record 2 at offset " + std::to_string(offsets[1]) + ": block cut off after " +
                              std::to_string(length - 6) + " of " + std::to_string(length) + " bytes\n";
    ToolProcess process(tool({"info", path("cut.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(), "form:       recording\n"
                                "technology: Ostrel_GSM\n"
                                "first:      2026-11-16 05:00:00.000 UTC\n"
                                "last:       2026-11-16 05:00:00.000 UTC\n"
                                "duration:   0.000 s\n"
                                "messages:   1\n"
                                "bytes:      17\n"
                                "prefixed:   0\n"
                                "too short:  0\n"
                                "wrong type: 0\n"
                                "lost:       1 (" +
                                    std::to_string(length - 6) +
                                    " bytes of the file)\n"
                                    "  " +
                                    place +
                                    "\n"
                                    "    code     messages  sections\n"
                                    "  0x512C            1  GSM RR Info\n");
    EXPECT_EQ(ownMessages(process.errors()), "velmora-log: " + path("cut.pcapng") + ": " + place);
}

TEST_F(InfoCommandTest, RecordingWithoutATechnologyIsCountedAllTheSame) {
    writeRecording("none.pcapng", "", {{at(0), rrState(5)}});
    ToolProcess process(tool({"info", path("none.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_THAT(process.output(), testing::StartsWith("form:       recording\ntechnology: not named\n"));
    EXPECT_THAT(process.output(), testing::EndsWith("  0x512C            1  -\n"));
    EXPECT_EQ(ownMessages(process.errors()), "velmora-log: " + path("none.pcapng") +
                                                 ": names no technology, wanted one of IFX, Ostrel_GSM, "
                                                 "Ostrel_CDMA, Ostrel_LTE, Ostrel_UTRAN2, Modem\n");
}

TEST_F(InfoCommandTest, EachFormIsNamed) {
    writeRecording("drive.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}, {at(1), rrState(5)}});
    for (const std::string form : {"velmora", "dlf"}) {
        ToolProcess process(tool({"convert", path("drive.pcapng"), path("drive." + form)}));
        ASSERT_EQ(process.exitStatus(), 0) << process.errors();
    }
    const std::pair<std::string, std::string> cases[] = {
        {"drive.pcapng", "recording"}, {"drive.velmora", "snapshot"}, {"drive.dlf", "DLF log"}};
    for (const auto& [name, form] : cases) {
        ToolProcess process(tool({"info", path(name)}));
        EXPECT_EQ(process.exitStatus(), 0) << process.errors();
        EXPECT_THAT(process.output(),
                    testing::StartsWith("form:       " + form + "\ntechnology: Ostrel_GSM\n"));
        EXPECT_THAT(process.output(), testing::EndsWith("  0x512C            2  GSM RR Info\n"));
    }
}

TEST_F(InfoCommandTest, RecordsOfCDMAAreCalledWhatTheyAre) {
    writeRecording("c2k.pcapng", "Ostrel_CDMA",
                   {{at(0), record(0x108A, "")}, {at(1), record(0x119C, "")}, {at(2), record(0x1375, "")}});
    ToolProcess process(tool({"info", path("c2k.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 0) << process.errors();
    EXPECT_THAT(process.output(), testing::EndsWith("    code     messages  records\n"
                                                    "  0x108A            1  Finger C/I\n"
                                                    "  0x119C            1  1x status\n"
                                                    "  0x1375            1  -\n"));
}

TEST_F(InfoCommandTest, TechnologyIsTheUsersBeforeTheFiles) {
    writeRecording("none.pcapng", "", {{at(0), rrState(5)}});
    ToolProcess process(tool({"info", "--technology", "Ostrel_GSM", path("none.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 0) << process.errors();
    EXPECT_THAT(process.output(), testing::StartsWith("form:       recording\ntechnology: Ostrel_GSM\n"));
    EXPECT_THAT(process.output(), testing::EndsWith("  0x512C            1  GSM RR Info\n"));
}

TEST_F(InfoCommandTest, MissingFileIsReported) {
    ToolProcess process(tool({"info", path("gone.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(), "");
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: " + path("gone.pcapng") + ": cannot open: No such file or directory\n");
}

} // namespace
} // namespace velmora
