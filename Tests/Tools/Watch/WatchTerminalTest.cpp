// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Watch/WatchCommandFixture.h"

namespace velmora {
namespace {

using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;

class WatchTerminalTest : public WatchCommandTest {
protected:
    /// 40 rows, "Row 0" to "Row 39", on a terminal of 12 rows.
    void sendRows() {
        const DictionaryRef display = makeDictionary();
        for (int i = 0; i < 40; ++i)
            display->set("Row " + std::to_string(i), "a value that leaves no room for a second column");
        _service->send(serialized(display));
    }
    [[nodiscard]] static bool echoes(const ToolProcess& process) {
        termios settings = {};
        return ::tcgetattr(process.terminal(), &settings) == 0 && (settings.c_lflag & ECHO) != 0;
    }
};

TEST_F(WatchTerminalTest, DrawsInPlaceScrollsAndRestores) {
    startService();
    ToolProcess process(onTerminal({"watch"}));
    ASSERT_TRUE(isStreaming());
    EXPECT_THAT(process.output(), StartsWith(enterScreen));
    EXPECT_FALSE(echoes(process));
    sendRows();
    auto place = process.waitFor("1-11/40\x1b[0m");
    ASSERT_TRUE(place);
    EXPECT_THAT(process.output(), HasSubstr("\x1b[HRow 0 "));
    EXPECT_THAT(process.output(), Not(HasSubstr("Row 11 ")));

    process.type("j");
    place = process.waitFor("2-12/40\x1b[0m", *place);
    ASSERT_TRUE(place);
    process.type("\x1b[6~");
    place = process.waitFor("13-23/40\x1b[0m", *place);
    ASSERT_TRUE(place);
    process.type("\x1b[F");
    place = process.waitFor("30-40/40\x1b[0m", *place);
    ASSERT_TRUE(place);
    EXPECT_THAT(process.output(), HasSubstr("Row 39 "));

    process.type("q");
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(process.output(), EndsWith(leaveScreen));
    EXPECT_TRUE(echoes(process));
    EXPECT_EQ(ownMessages(process.errors()), "");
}

TEST_F(WatchTerminalTest, FollowsTheSizeOfTheWindow) {
    startService();
    ToolProcess process(onTerminal({"watch"}));
    ASSERT_TRUE(isStreaming());
    sendRows();
    const auto place = process.waitFor("1-11/40\x1b[0m");
    ASSERT_TRUE(place);
    process.resize(44, 6);
    const auto end = process.waitFor("1-5/40\x1b[0m", *place);
    ASSERT_TRUE(end);
    // The terminal itself puts one more carriage return before each line feed.
    EXPECT_EQ(std::regex_replace(withoutTimes(process.output().substr(*place, *end - *place)),
                                 std::regex("\r\r\n"), "\r\n"),
              "\x1b[HRow 0   a value that leaves no room for a s…\r\n"
              "Row 1   a value that leaves no room for a s…\r\n"
              "Row 2   a value that leaves no room for a s…\r\n"
              "Row 3   a value that leaves no room for a s…\r\n"
              "Row 4   a value that leaves no room for a s…\r\n"
              "\x1b[7mUpdated TIME        1-5/40\x1b[0m");
}

TEST_F(WatchTerminalTest, TheScreenSaysWhatIsWrongAndWhatToStart) {
    ToolProcess process(onTerminal({"watch"}));
    ASSERT_TRUE(process.waitFor("Connecting... no telephony service answers"));
    EXPECT_THAT(process.output(), HasSubstr("\x1b[Hstart one with velmora-telephonyd --source modemmanager"));
    EXPECT_THAT(process.output(), HasSubstr("scenario:gsm,seed=1 (a\r\r\nsynthetic drive)"));
    startService();
    ASSERT_TRUE(isStreaming());
    sendRows();
    const auto refreshed = process.waitFor("1-11/40\x1b[0m");
    ASSERT_TRUE(refreshed);
    EXPECT_THAT(process.output().substr(process.output().rfind("\x1b[7m", *refreshed)),
                StartsWith("\x1b[7mUpdated "));
    // The rows stay when the service goes.
    _service.reset();
    ASSERT_TRUE(process.waitFor("Connecting... no telephony service answers; start one with", *refreshed));
    EXPECT_THAT(process.output().substr(process.output().rfind("\x1b[H")), StartsWith("\x1b[HRow 0 "));
    process.type("q");
    EXPECT_EQ(process.exitStatus(), 0);
}

TEST_F(WatchTerminalTest, ANoteThatTheStatusLineCutsIsShownWholeAbove) {
    startService("");
    ToolProcess process(onTerminal({"watch"}));
    // Of 60 columns the status takes 14.
    ASSERT_TRUE(process.waitFor("Connecting... the telephony service does not name its techn…"));
    EXPECT_THAT(process.output(),
                HasSubstr("\x1b[Hthe telephony service does not name its technology; it may"));
    EXPECT_THAT(process.output(), HasSubstr("\r\r\nrestart it\x1b[K"));
    process.type("q");
    EXPECT_EQ(process.exitStatus(), 0);
}

TEST_F(WatchTerminalTest, EndsWithTheSignalsOfAUser) {
    for (const int number : {SIGINT, SIGTERM, SIGHUP}) {
        ToolProcess process(onTerminal({"watch"}));
        ASSERT_TRUE(process.waitFor("Connecting..."));
        process.signal(number);
        EXPECT_EQ(process.exitStatus(), 0) << number;
        EXPECT_THAT(process.output(), EndsWith(leaveScreen));
        EXPECT_TRUE(echoes(process));
    }
}

TEST_F(WatchTerminalTest, InterruptKeyEndsIt) {
    ToolProcess process(onTerminal({"watch"}));
    ASSERT_TRUE(process.waitFor("Connecting..."));
    process.type("\x03");
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(process.output(), EndsWith(leaveScreen));
}

} // namespace
} // namespace velmora
