// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Mask/MaskFixture.h"

#include <gmock/gmock.h>

#include <fstream>

#include <sys/stat.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::MatchesRegex;
using testing::Not;
using testing::StartsWith;

class MaskCommandTest : public MaskTest {};

TEST_F(MaskCommandTest, MessagesAreMaskedAndKeepTheirTimes) {
    EXPECT_EQ(mask({"--key", path("key"), path("drive.pcapng"), path("out/a.pcapng")}).messages, "");
    EXPECT_EQ(cardIn("out/a.pcapng"), _masked);
    const std::vector<LoggedMessage> messages = messagesOf("out/a.pcapng");
    ASSERT_EQ(messages.size(), _drive.size());
    for (std::size_t i = 0; i < messages.size(); ++i)
        EXPECT_EQ(messages[i].time, _drive[i].time);
    EXPECT_EQ(messages[0].message, _drive[0].message);
    EXPECT_EQ(messages[2].message, record(0x1375, "00 00 00 00"));
}

TEST_F(MaskCommandTest, FileIsForItsUserAlone) {
    static_cast<void>(mask({path("drive.pcapng"), path("out/a.pcapng")}));
    struct stat status = {};
    ASSERT_EQ(::stat(path("out/a.pcapng").c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 0777U, 0600U);
}

TEST_F(MaskCommandTest, WithoutAKeyPseudonymsAreOthersEachTime) {
    static_cast<void>(mask({path("drive.pcapng"), path("out/a.pcapng")}));
    static_cast<void>(mask({path("drive.pcapng"), path("out/b.pcapng")}));
    EXPECT_NE(cardIn("out/a.pcapng"), cardIn("out/b.pcapng"));
    EXPECT_NE(cardIn("out/a.pcapng"), iccid);
}

TEST_F(MaskCommandTest, ReportHasCountsAndNoValues) {
    const std::string output = mask({"--report", path("drive.pcapng"), path("out/a.pcapng")}).output;
    EXPECT_EQ(output, path("drive.pcapng") + ": 4 messages, 2 changed, 0 left out\n"
                                             "  subscriber 1\n"
                                             "  unknown code 1: 0x1375 1\n");
}

TEST_F(MaskCommandTest, UnknownMessagesMayBeKept) {
    static_cast<void>(mask({"--keep-unknown", path("drive.pcapng"), path("out/a.pcapng")}));
    EXPECT_EQ(messagesOf("out/a.pcapng")[2].message, _drive[2].message);
}

TEST_F(MaskCommandTest, SecondTimeChangesNothing) {
    static_cast<void>(mask({"--key", path("key"), path("drive.pcapng"), path("out/a.pcapng")}));
    static_cast<void>(mask({"--key", path("key"), path("out/a.pcapng"), path("out/b.pcapng")}));
    EXPECT_EQ(contentOf("out/a.pcapng"), contentOf("out/b.pcapng"));
}

TEST_F(MaskCommandTest, MessagesAddedToAMaskedFileAreMasked) {
    static_cast<void>(mask({"--key", path("key"), path("drive.pcapng"), path("out/a.pcapng")}));
    // Two sections, the second one of which is not masked.
    std::ofstream(path("both.pcapng"), std::ios::binary)
        << contentOf("out/a.pcapng") << contentOf("drive.pcapng");
    EXPECT_THAT(mask({"--check", path("both.pcapng")}, 1).output, HasSubstr("in clear: subscriber 2"));
    static_cast<void>(mask({"--key", path("key"), path("both.pcapng"), path("out/b.pcapng")}));
    EXPECT_THAT(contentOf("out/b.pcapng"), Not(HasSubstr(iccid)));
}

TEST_F(MaskCommandTest, NothingIsOverwrittenWithoutForce) {
    std::ofstream(path("out/a.pcapng")) << "old";
    EXPECT_THAT(mask({path("drive.pcapng"), path("out/a.pcapng")}, 1).messages,
                HasSubstr("is there already; --force overwrites it"));
    EXPECT_EQ(contentOf("out/a.pcapng"), "old");
    static_cast<void>(mask({"--force", path("drive.pcapng"), path("out/a.pcapng")}));
    EXPECT_EQ(messagesOf("out/a.pcapng").size(), 4U);
    EXPECT_THAT(mask({"--force", path("out/a.pcapng"), path("out/a.pcapng")}, 1).messages,
                HasSubstr("is the input, wanted another file"));
}

TEST_F(MaskCommandTest, KeyIsMadeOnceForItsUserAlone) {
    EXPECT_EQ(mask({"--new-key", path("out/key")}).messages, "");
    struct stat status = {};
    ASSERT_EQ(::stat(path("out/key").c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 0777U, 0600U);
    const std::string key = contentOf("out/key");
    EXPECT_THAT(key, MatchesRegex("[0-9a-f]+\n"));
    EXPECT_EQ(key.size(), 65U);
    EXPECT_THAT(mask({"--new-key", path("out/key")}, 1).messages, HasSubstr("exists"));
    EXPECT_EQ(contentOf("out/key"), key);
    static_cast<void>(mask({"--key", path("out/key"), path("drive.pcapng"), path("out/a.pcapng")}));
}

TEST_F(MaskCommandTest, KeyThatOthersCanReadIsRefused) {
    std::filesystem::permissions(path("key"), std::filesystem::perms(0640));
    EXPECT_THAT(mask({"--key", path("key"), path("drive.pcapng"), path("out/a.pcapng")}, 1).messages,
                HasSubstr("can be read by other users, wanted a file of its owner alone"));
    EXPECT_THAT(outputs(), IsEmpty());
}

TEST_F(MaskCommandTest, WhatIsNoKeyIsRefusedWithoutShowingIt) {
    std::ofstream(path("key")) << "secret";
    const std::string message =
        mask({"--key", path("key"), path("drive.pcapng"), path("out/a.pcapng")}, 1).messages;
    EXPECT_EQ(message,
              "velmora-log: " + path("key") + ": no key: 6 characters, wanted 64 hexadecimal digits\n");
}

TEST_F(MaskCommandTest, CheckFindsIdentitiesInClear) {
    const std::string file = path("drive.pcapng");
    EXPECT_EQ(mask({"--check", file}, 1).output,
              file + ": in clear: subscriber 1\n" + file + ": in clear: unknown code 1: 0x1375 1\n");
    static_cast<void>(mask({file, path("out/a.pcapng")}));
    EXPECT_EQ(mask({"--check", path("out/a.pcapng")}).output,
              path("out/a.pcapng") + ": no identities of level identity in clear\n");
}

TEST_F(MaskCommandTest, CheckOfAHigherLevelNeedsThatLevel) {
    const std::vector<TimedMessage> drive = {{at(0), record(0x7135, "02 03 00 F1 10 10 05 0B "
                                                                    "00 00 00 00 00 00 00 00 00 00 00")}};
    writeRecording("area.pcapng", "Ostrel_GSM", drive);
    static_cast<void>(mask({path("area.pcapng"), path("out/a.pcapng")}));
    EXPECT_THAT(mask({"--check", "--level", "location", path("out/a.pcapng")}, 1).output,
                HasSubstr("in clear: location "));
    static_cast<void>(mask({"--level", "location", path("area.pcapng"), path("out/b.pcapng")}));
    static_cast<void>(mask({"--check", "--level", "location", path("out/b.pcapng")}));
}

TEST_F(MaskCommandTest, CheckFindsKnownValuesWithoutPrintingThem) {
    std::ofstream(path("known")) << "nothing like that\n" << iccid << "\n";
    const std::string output = mask({"--check", path("drive.pcapng"), "--known", path("known")}, 1).output;
    EXPECT_THAT(output, HasSubstr("line 2 of " + path("known") + " found: text\n"));
    EXPECT_THAT(output, Not(HasSubstr(iccid)));
    static_cast<void>(mask({path("drive.pcapng"), path("out/a.pcapng")}));
    EXPECT_THAT(mask({"--check", path("out/a.pcapng"), "--known", path("known")}).output,
                Not(HasSubstr("found")));
}

TEST_F(MaskCommandTest, KnownValueThatIsTooShortIsAnError) {
    std::ofstream(path("known")) << "123\n";
    EXPECT_THAT(mask({"--check", path("drive.pcapng"), "--known", path("known")}, 1).messages,
                HasSubstr("line 1 is too short, wanted 4 characters or more"));
}

TEST_F(MaskCommandTest, LossesAreReportedAndTheRestIsMasked) {
    const std::string content = contentOf("drive.pcapng");
    std::ofstream(path("short.pcapng"), std::ios::binary) << content.substr(0, content.size() - 7);
    EXPECT_THAT(mask({path("short.pcapng"), path("out/a.pcapng")}, 1).messages, HasSubstr("record 4"));
    EXPECT_EQ(messagesOf("out/a.pcapng").size(), 3U);
}

TEST_F(MaskCommandTest, UnreadableInputLeavesNoFile) {
    std::ofstream(path("text")) << "no log messages at all, for some hundred bytes " << std::string(300, 'x');
    static_cast<void>(mask({path("text"), path("out/a.pcapng")}, 1));
    static_cast<void>(mask({path("missing"), path("out/a.pcapng")}, 1));
    EXPECT_THAT(outputs(), IsEmpty());
}

TEST_F(MaskCommandTest, IdentitiesAreInNoLogLine) {
    ToolProcess::Setup setup =
        tool({"-v", "--log-level", "7", "mask", "--report", path("drive.pcapng"), path("out/a.velmora")});
    ToolProcess process(setup);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(process.output() + process.errors(), Not(HasSubstr(iccid)));
}

} // namespace
} // namespace velmora
