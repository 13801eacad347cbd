// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <filesystem>

namespace velmora {
namespace {

using testing::EndsWith;
using testing::HasSubstr;
using testing::Not;

/// A recording of a GSM phone: it lists networks, is idle, reports that again, and lists networks.
class LineBrowserTest : public ToolTest {
protected:
    LineBrowserTest() {
        writeRecording(
            "drive.pcapng", "Ostrel_GSM",
            {{at(0), rrState(4)}, {at(1000), rrState(5)}, {at(2500), rrState(5)}, {at(2000), rrState(4)}});
    }

    /// What the commands print after the two lines of the file.
    [[nodiscard]] std::string answers(const std::string& commands, const std::string& name = "drive.pcapng") {
        ToolProcess::Setup setup = tool({"browse", "--line", path(name)});
        setup.input = commands;
        ToolProcess process(setup);
        EXPECT_EQ(process.exitStatus(), 0);
        EXPECT_EQ(ownMessages(process.errors()), "");
        const std::string output = process.output();
        return output.substr(output.find('\n', output.find('\n') + 1) + 1);
    }
};

TEST_F(LineBrowserTest, GoesThroughTheMessages) {
    const std::string text = answers("\n\n\n\n");
    EXPECT_THAT(text, HasSubstr("message        2  05:00:01.000    +1.000  0x512C  "));
    EXPECT_THAT(text, HasSubstr("message        3  05:00:02.500    +1.500  0x512C  "));
    // The time goes back, as in a merged recording.
    EXPECT_THAT(text, HasSubstr("message        4  05:00:02.000    -0.500  0x512C  "));
    EXPECT_THAT(text, HasSubstr("the last message\n"));
}

TEST_F(LineBrowserTest, SaysWhatAMessageChanged) {
    EXPECT_THAT(answers("2\nc\n"), HasSubstr("= RR_IDLE (changed)\n"));
    EXPECT_THAT(answers("3\nc\n"), Not(HasSubstr("RR_IDLE")));
    EXPECT_THAT(answers("3\nd\n"), HasSubstr("= RR_IDLE\n"));
    EXPECT_THAT(answers("2\nb\nd\n"), HasSubstr("= RR_PLMN_LIST_CONSTRUCTION (changed)\n"));
}

TEST_F(LineBrowserTest, SearchesBothWays) {
    EXPECT_THAT(answers("/rr_idle\nn\nn\n"),
                testing::MatchesRegex("message        2 [^\n]*\nmessage        3 [^\n]*\n"
                                      "no later message has \"rr_idle\"\nmessage        3 [^\n]*\n"));
    EXPECT_THAT(answers("/rr_idle\n$\nN\nN\nN\n"),
                EndsWith("no earlier message has \"rr_idle\"\n" + answers("2\n")));
}

TEST_F(LineBrowserTest, FiltersByCodesAndConditions) {
    EXPECT_EQ(answers("f 0x5134\n"),
              "no message passes the filter; f with an empty one lists all\nno messages\n");
    EXPECT_THAT(answers("f 0x512C\n$\n"), HasSubstr("message        4 "));
    EXPECT_THAT(answers("f serving.level\n"), HasSubstr("wanted a condition"));
    EXPECT_THAT(answers("f (\n"), HasSubstr("column "));
}

TEST_F(LineBrowserTest, GoesToATime) {
    EXPECT_THAT(answers("t 05:00:00.5\n"), HasSubstr("message        2 "));
    EXPECT_THAT(answers("t +1.2\n"), HasSubstr("message        3 "));
    EXPECT_THAT(answers("3\nt -2.5\n"), EndsWith(answers("1\n")));
    EXPECT_THAT(answers("t noon\n"), HasSubstr("got noon, wanted a time such as 05:02:40"));
}

TEST_F(LineBrowserTest, WritesTheRangeWithItsNotesAndLeavesTheInput) {
    const std::string before = contentOf("drive.pcapng");
    EXPECT_THAT(answers("2\nv\nm begins here\n\nw " + path("part.pcapng") + "\n"),
                EndsWith("2 messages written\n"));
    EXPECT_EQ(contentOf("drive.pcapng"), before);
    const std::string text = answers("1\n\n\n", "part.pcapng");
    EXPECT_THAT(text, HasSubstr("message        1  05:00:01.000 "));
    EXPECT_THAT(text, HasSubstr("  * begins here\n"));
    EXPECT_THAT(text, HasSubstr("message        2  05:00:02.500    +1.500 "));
    EXPECT_THAT(text, HasSubstr("the last message\n"));
    // Nothing is overwritten.
    EXPECT_THAT(answers("w " + path("part.pcapng") + "\n"),
                HasSubstr("part.pcapng is there already; nothing is overwritten"));
    EXPECT_THAT(answers("w " + path("drive.pcapng") + "\n"), HasSubstr("drive.pcapng is there already"));
    EXPECT_EQ(contentOf("drive.pcapng"), before);
}

TEST_F(LineBrowserTest, PrintsTheBytes) {
    // Type, length, code and time stamp, then the state.
    EXPECT_THAT(answers("h\n"), testing::StartsWith("0110002c51000000000000000004"));
}

TEST_F(LineBrowserTest, SaysThatAFileHasOneTechnology) {
    EXPECT_THAT(answers("T\n"), EndsWith("no other technology in the file\n"));
}

TEST_F(LineBrowserTest, HostileTextsAreEscaped) {
    EXPECT_THAT(answers("m \x1b[2J\xff\nb\n"), Not(HasSubstr("\x1b")));
    EXPECT_THAT(answers("/\x1b]0;x\x07\n"), HasSubstr("no later message has \"\\x1B]0;x\\x07\""));
}

TEST_F(LineBrowserTest, RefusesWhatItCannotShow) {
    ToolProcess missing(tool({"browse", "--line", path("missing.pcapng")}));
    EXPECT_EQ(missing.exitStatus(), 1);
    EXPECT_EQ(ownMessages(missing.errors()),
              "velmora-log: " + path("missing.pcapng") + ": cannot open: No such file or directory\n");
    ToolProcess noTerminal(tool({"browse", path("drive.pcapng")}));
    EXPECT_EQ(noTerminal.exitStatus(), 1);
    EXPECT_EQ(ownMessages(noTerminal.errors()),
              "velmora-log: standard output is no terminal; --line prints lines of text\n");
}

} // namespace
} // namespace velmora
