// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/LoopTimer.h"
#include "Recording/OpenMessages.h"
#include "Tests/Tools/Convert/ConvertFixture.h"

#include <gmock/gmock.h>

#include <chrono>
#include <csignal>
#include <filesystem>
#include <fstream>

#include <fcntl.h>
#include <sys/stat.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

class ConvertCommandTest : public ConvertTest {};

TEST_F(ConvertCommandTest, RecordingIsMadeTheSameAgain) {
    EXPECT_EQ(convert({path("drive.pcapng"), path("out/copy.pcapng")}, 0), "");
    EXPECT_EQ(contentOf("out/copy.pcapng"), contentOf("drive.pcapng"));
    EXPECT_THAT(outputs(), ElementsAre("copy.pcapng"));
}

TEST_F(ConvertCommandTest, SnapshotIsWhatTheApplicationWouldHaveWritten) {
    EXPECT_EQ(convert({path("drive.pcapng"), path("out/drive.velmora")}, 0), "");
    const Value list = snapshot("out/drive.velmora");
    ASSERT_NE(list.asDictionary(), nullptr);
    std::vector<std::string> keys;
    for (const auto& [key, value] : *list.asDictionary())
        keys.push_back(key);
    EXPECT_THAT(keys, ElementsAre("Timestamp", "Data", "Description"));
    // Refreshes lie 2 s apart from the first message on: at 2 s with the first two messages, and at 6 s.
    EXPECT_EQ((*list.asDictionary())["Timestamp"], Value("2026-11-16 05:00:06 +0000"));
    EXPECT_EQ((*list.asDictionary())["Description"], Value(""));
    const Array& data = *(*list.asDictionary())["Data"].asArray();
    ASSERT_EQ(data.size(), 3U);
    const Dictionary& first = *data[0].asDictionary();
    EXPECT_EQ(first["DisplayState"], Value(joined(_drive[0].message, _drive[1].message)));
    EXPECT_EQ(first["Date"], Value("2026-11-16 05:00:02 +0000"));
    EXPECT_EQ(first["Description"], Value("Snapshot (2026-11-16 05:00:02 +0000)"));
    const Dictionary& second = *data[1].asDictionary();
    EXPECT_EQ(second["DisplayState"], Value(_drive[2].message));
    EXPECT_EQ((*(*second["Display"].asDictionary())["GSM RR Info"].asDictionary())["RR State"],
              Value("RR_IDLE"));
    EXPECT_EQ(second["Date"], Value("2026-11-16 05:00:06 +0000"));
    // 161 bytes, then each entry less its first byte: 17 + 14 - 1, and 17 - 1.
    EXPECT_EQ((*data[2].asDictionary())["Description"], Value("DLF binary (207 bytes)"));
}

TEST_F(ConvertCommandTest, DescriptionIsTheUsers) {
    EXPECT_EQ(convert({"--description", "gate <4>", path("drive.pcapng"), path("out/drive.velmora")}, 0), "");
    EXPECT_EQ((*snapshot("out/drive.velmora").asDictionary())["Description"], Value("gate <4>"));
}

TEST_F(ConvertCommandTest, SnapshotIsABinaryListWhereXMLCannotCarryAValue) {
    using namespace std::string_literals;
    const Value display(std::make_shared<Dictionary>(
        std::initializer_list<Dictionary::Entry>{{"a\0b"s, "\0\x1B\uFFFF"s}, {"c", "plain"}}));
    const auto message = writeBinaryPropertyList(display);
    ASSERT_TRUE(message) << message.reason();
    const Data sent = Data(std::vector<std::uint8_t>(*message));
    writeRecording("i.pcapng", "IFX", {{at(0), sent}});
    EXPECT_EQ(convert({path("i.pcapng"), path("out/i.velmora")}, 0), "");
    EXPECT_EQ(contentOf("out/i.velmora").substr(0, 8), "bplist00");
    const Value list = snapshot("out/i.velmora");
    ASSERT_NE(list.asDictionary(), nullptr);
    const Array& data = *(*list.asDictionary())["Data"].asArray();
    EXPECT_EQ((*data[0].asDictionary())["Display"], display);
    EXPECT_THAT(messagesOf("out/i.velmora"), ElementsAre(sent)) << "the same bytes";
    EXPECT_EQ(convert({path("out/i.velmora"), path("out/again.pcapng")}, 0), "");
    EXPECT_THAT(messagesOf("out/again.pcapng"), ElementsAre(sent));
}

TEST_F(ConvertCommandTest, DLFLogHasTheRecordsWithoutTheirTypes) {
    EXPECT_EQ(convert({path("drive.pcapng"), path("out/drive.dlf")}, 0), "");
    const std::string log = contentOf("out/drive.dlf");
    EXPECT_EQ(log.size(), 161U + 16 + 13 + 16);
    EXPECT_EQ(log.substr(0, 4), std::string("\xA1\x00\xFD\x1F", 4)) << "the version report";
    // 2026-11-16 05:00:00 UTC, the first message's time, is 1794805200, or 0x6AFA8DD0.
    EXPECT_EQ(log.substr(81, 4), "\xD0\x8D\xFA\x6A");
    const Bytes firstRecord = _drive[0].message.bytes().subspan(1);
    EXPECT_EQ(log.substr(161, 16), std::string(firstRecord.begin(), firstRecord.end()));
    EXPECT_THAT(messagesOf("out/drive.dlf"),
                ElementsAre(_drive[0].message, _drive[1].message, _drive[2].message));
}

TEST_F(ConvertCommandTest, EachFormIsReadBack) {
    EXPECT_EQ(convert({path("drive.pcapng"), path("out/a.velmora")}, 0), "");
    EXPECT_EQ(convert({path("out/a.velmora"), path("out/b.dlf")}, 0), "");
    EXPECT_EQ(convert({path("out/b.dlf"), path("out/c.pcapng")}, 0), "");
    EXPECT_THAT(messagesOf("out/c.pcapng"),
                ElementsAre(_drive[0].message, _drive[1].message, _drive[2].message));
}

TEST_F(ConvertCommandTest, DashIsStandardInput) {
    EXPECT_EQ(convert({"-", path("out/drive.dlf")}, 0, contentOf("drive.pcapng")), "");
    EXPECT_EQ(messagesOf("out/drive.dlf").size(), 3U);
}

TEST_F(ConvertCommandTest, NewFileIsItsUsersAlone) {
    const mode_t earlier = ::umask(0);
    for (const char* name : {"out/drive.dlf", "out/drive.pcapng", "out/drive.velmora"}) {
        EXPECT_EQ(convert({path("drive.pcapng"), path(name)}, 0), "");
        EXPECT_EQ(std::filesystem::status(path(name)).permissions(), std::filesystem::perms(0600)) << name;
    }
    ::umask(earlier);
}

TEST_F(ConvertCommandTest, OutputWithoutAFormIsAUsageError) {
    for (const std::string out : {"-", "drive", "drive.txt", "drive.PCAPNG", "velmora"})
        EXPECT_EQ(
            convert({path("drive.pcapng"), out}, 2),
            "velmora-log: OUT: got " + out +
                ", wanted a name that ends in .pcapng, .velmora, .dlf, .gpx, .geojson, .kml or .sqlite\n"
                "velmora-log --help tells more\n");
}

TEST_F(ConvertCommandTest, FileThatIsThereIsKeptUnlessForced) {
    std::ofstream(path("out/drive.dlf")) << "an earlier one";
    EXPECT_EQ(convert({path("drive.pcapng"), path("out/drive.dlf")}, 1),
              "velmora-log: " + path("out/drive.dlf") + " is there already; --force overwrites it\n");
    EXPECT_EQ(contentOf("out/drive.dlf"), "an earlier one");
    std::filesystem::permissions(path("out/drive.dlf"), std::filesystem::perms(0640));
    EXPECT_EQ(convert({"--force", path("drive.pcapng"), path("out/drive.dlf")}, 0), "");
    EXPECT_EQ(messagesOf("out/drive.dlf").size(), 3U);
    EXPECT_EQ(std::filesystem::status(path("out/drive.dlf")).permissions(), std::filesystem::perms(0640));
    EXPECT_THAT(outputs(), ElementsAre("drive.dlf"));
}

TEST_F(ConvertCommandTest, SymbolicLinkIsFollowed) {
    std::filesystem::create_directory(_directory / "elsewhere");
    std::ofstream(path("elsewhere/old.dlf")) << "an earlier one";
    std::filesystem::create_symlink(path("elsewhere/old.dlf"), path("out/link.dlf"));
    EXPECT_EQ(convert({path("drive.pcapng"), path("out/link.dlf")}, 1),
              "velmora-log: " + path("out/link.dlf") + " is there already; --force overwrites it\n");
    EXPECT_EQ(convert({"--force", path("drive.pcapng"), path("out/link.dlf")}, 0), "");
    EXPECT_TRUE(std::filesystem::is_symlink(path("out/link.dlf")));
    EXPECT_FALSE(std::filesystem::is_symlink(path("elsewhere/old.dlf")));
    EXPECT_EQ(messagesOf("elsewhere/old.dlf").size(), 3U);
    EXPECT_THAT(outputs(), ElementsAre("link.dlf"));
}

TEST_F(ConvertCommandTest, SymbolicLinkIsFollowedToAFileOfTheUserOnly) {
    std::filesystem::create_symlink(path("gone.dlf"), path("out/link.dlf"));
    EXPECT_EQ(convert({"--force", path("drive.pcapng"), path("out/link.dlf")}, 1),
              "velmora-log: " + path("out/link.dlf") + " is a symbolic link to a file that does not exist\n");
    EXPECT_FALSE(std::filesystem::exists(path("gone.dlf")));
    std::ofstream(path("gone.dlf")) << "another user's";
    if (::chown(path("gone.dlf").c_str(), 1, 1) != 0)
        GTEST_SKIP() << "only root can give files away";
    EXPECT_EQ(convert({"--force", path("drive.pcapng"), path("out/link.dlf")}, 1),
              "velmora-log: " + path("out/link.dlf") + " is a symbolic link to " + path("gone.dlf") +
                  ", wanted a regular file of this user\n");
    EXPECT_EQ(contentOf("gone.dlf"), "another user's");
}

TEST_F(ConvertCommandTest, InputIsNeverTheOutput) {
    const std::string before = contentOf("drive.pcapng");
    std::filesystem::create_hard_link(path("drive.pcapng"), path("out/link.pcapng"));
    std::filesystem::create_symlink(path("drive.pcapng"), path("out/symlink.pcapng"));
    for (const std::string name :
         {"drive.pcapng", "out/../drive.pcapng", "out/link.pcapng", "out/symlink.pcapng"})
        EXPECT_EQ(convert({"--force", path("drive.pcapng"), path(name)}, 1),
                  "velmora-log: " + path(name) + " is the input, wanted another file\n");
    ToolProcess piped(tool({"-c", "exec \"$0\" convert --force - \"$1\" < \"$1\"",
                            VELMORA_BUILD_DIR "/velmora-log", path("drive.pcapng")}),
                      "/bin/sh");
    EXPECT_EQ(piped.exitStatus(), 1);
    EXPECT_EQ(ownMessages(piped.errors()),
              "velmora-log: " + path("drive.pcapng") + " is the input, wanted another file\n");
    EXPECT_EQ(contentOf("drive.pcapng"), before);
}

TEST_F(ConvertCommandTest, NonFileOutputIsNotReplaced) {
    std::filesystem::create_directory(path("out/drive.dlf"));
    EXPECT_EQ(convert({"--force", path("drive.pcapng"), path("out/drive.dlf")}, 1),
              "velmora-log: " + path("out/drive.dlf") + " is no regular file\n");
    EXPECT_EQ(convert({path("drive.pcapng"), path("nowhere/drive.dlf")}, 1),
              "velmora-log: " + path("nowhere/drive.dlf") +
                  ": cannot be opened for writing: No such file or directory\n");
}

TEST_F(ConvertCommandTest, LossIsReportedAndTheRestConverted) {
    std::filesystem::resize_file(path("drive.pcapng"), std::filesystem::file_size(path("drive.pcapng")) - 6);
    for (const std::string form : {".pcapng", ".velmora", ".dlf"}) {
        const std::string words = convert({path("drive.pcapng"), path("out/drive" + form)}, 1);
        EXPECT_THAT(words, HasSubstr(path("drive.pcapng") + ": record 3 at offset ")) << form;
        EXPECT_THAT(words, HasSubstr(": block cut off after 46 of 52 bytes\n")) << form;
        EXPECT_THAT(messagesOf("out/drive" + form), ElementsAre(_drive[0].message, _drive[1].message))
            << form;
    }
}

TEST_F(ConvertCommandTest, UnrepresentableMessagesAreReportedAndTheRestConverted) {
    const auto offsets = writeRecording("odd.pcapng", "Ostrel_GSM",
                                        {{at(0), rrState(4)}, {at(1), hex("01 02 03")}, {at(2), rrState(5)}});
    EXPECT_EQ(convert({path("odd.pcapng"), path("out/odd.dlf")}, 1),
              "velmora-log: " + path("odd.pcapng") + ": record 2 at offset " + std::to_string(offsets[1]) +
                  ": left out: message of 3 bytes, wanted a record header of 13 at least\n");
    EXPECT_THAT(messagesOf("out/odd.dlf"), ElementsAre(rrState(4), rrState(5)));
}

TEST_F(ConvertCommandTest, SkippedMessagesAreReportedUpToAHundred) {
    std::vector<TimedMessage> messages(103, {at(0), hex("01")});
    messages.push_back({at(1), rrState(5)});
    writeRecording("odd.pcapng", "Ostrel_GSM", messages);
    const std::string words = convert({path("odd.pcapng"), path("out/odd.dlf")}, 1);
    EXPECT_EQ(std::count(words.begin(), words.end(), '\n'), 101);
    EXPECT_THAT(words,
                testing::EndsWith("velmora-log: " + path("odd.pcapng") + ": left out 103 messages in all\n"));
    EXPECT_THAT(messagesOf("out/odd.dlf"), ElementsAre(rrState(5)));
}

TEST_F(ConvertCommandTest, SerializedObjectsHaveNoDLFLog) {
    writeRecording("ifx.pcapng", "IFX", {{at(0), serialized(Value("x"))}});
    EXPECT_EQ(convert({path("ifx.pcapng"), path("out/ifx.dlf")}, 1),
              "velmora-log: " + path("ifx.pcapng") +
                  ": technology IFX has no DLF log: its messages are no records\n");
    EXPECT_THAT(outputs(), ElementsAre());
}

TEST_F(ConvertCommandTest, TechnologyIsTheUsersBeforeTheFiles) {
    writeRecording("none.pcapng", "", {{at(0), rrState(5)}});
    for (const std::string form : {".pcapng", ".velmora", ".dlf"}) {
        EXPECT_EQ(convert({path("none.pcapng"), path("out/none" + form)}, 1),
                  "velmora-log: " + path("none.pcapng") +
                      ": names no technology, wanted one of IFX, Ostrel_GSM, Ostrel_CDMA, Ostrel_LTE, "
                      "Ostrel_UTRAN2, Modem; --technology supplies it\n")
            << form;
        EXPECT_THAT(outputs(), ElementsAre()) << form;
    }
    EXPECT_EQ(convert({"--technology", "lte", path("none.pcapng"), path("out/named.pcapng")}, 0), "");
    const auto reader = openMessages(path("out/named.pcapng"));
    ASSERT_TRUE(reader);
    EXPECT_EQ((*reader)->technology(), "Ostrel_LTE");
}

TEST_F(ConvertCommandTest, MessageThatEndsADecoderLeavesWhatWasThere) {
    writeRecording("ifx.pcapng", "IFX", {{at(0), hex("01 02 03")}});
    std::ofstream(path("out/ifx.velmora")) << "an earlier one";
    EXPECT_THAT(convert({"--strict", "--force", path("ifx.pcapng"), path("out/ifx.velmora")}, 1),
                HasSubstr("Could not deserialize the object"));
    EXPECT_EQ(contentOf("out/ifx.velmora"), "an earlier one");
    EXPECT_THAT(outputs(), ElementsAre("ifx.velmora"));
}

TEST_F(ConvertCommandTest, FailureToWriteLeavesWhatWasThere) {
    std::ofstream(path("out/drive.pcapng")) << "an earlier one";
    for (const std::string form : {".pcapng", ".velmora", ".dlf"}) {
        const std::string out = path("out/drive" + form);
        ToolProcess process(tool({"-c", "ulimit -f 0; exec \"$0\" convert --force \"$1\" \"$2\"",
                                  (VELMORA_BUILD_DIR "/velmora-log"), path("drive.pcapng"), out}),
                            "/bin/sh");
        EXPECT_EQ(process.exitStatus(), 1);
        EXPECT_EQ(ownMessages(process.errors()),
                  form == ".velmora" ? "velmora-log: " + out + ": cannot be written: File too large\n"
                                     : "velmora-log: cannot write " + out + ": File too large\n");
    }
    EXPECT_EQ(contentOf("out/drive.pcapng"), "an earlier one");
    EXPECT_THAT(outputs(), ElementsAre("drive.pcapng"));
}

TEST_F(ConvertCommandTest, InterruptedConversionLeavesNothing) {
    const std::string pipe = path("pipe");
    ASSERT_EQ(::mkfifo(pipe.c_str(), 0600), 0);
    const FileDescriptor end(::open(pipe.c_str(), O_RDWR | O_CLOEXEC));
    const std::string begun = contentOf("drive.pcapng");
    ASSERT_EQ(::write(end.get(), begun.data(), begun.size()), static_cast<ssize_t>(begun.size()));
    ToolProcess process(tool({"convert", pipe, path("out/drive.dlf")}));
    // Nothing but time makes the test's event loop look again.
    LoopTimer look([] {});
    look.startRepeating(std::chrono::milliseconds(20));
    ASSERT_TRUE(eventually([&] { return !outputs().empty(); })) << "the temporary file";
    process.signal(SIGTERM);
    EXPECT_EQ(process.exitStatus(), 128 + SIGTERM);
    EXPECT_THAT(outputs(), ElementsAre());
}

TEST_F(ConvertCommandTest, MissingFileIsReported) {
    EXPECT_EQ(convert({path("gone.pcapng"), path("out/gone.dlf")}, 1),
              "velmora-log: " + path("gone.pcapng") + ": cannot open: No such file or directory\n");
    EXPECT_THAT(outputs(), ElementsAre());
}

} // namespace
} // namespace velmora
