// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <chrono>
#include <csignal>
#include <thread>

#include <termios.h>

namespace velmora {
namespace {

using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;

constexpr const char* enterScreen = "\x1b[?1049h\x1b[?25l";
constexpr const char* leaveScreen = "\x1b[?25h\x1b[?1049l";

class BrowserTerminalTest : public ToolTest {
protected:
    BrowserTerminalTest() {
        std::vector<TimedMessage> messages;
        for (int i = 0; i < 40; ++i)
            messages.push_back({at(i * 100), rrState(static_cast<std::uint8_t>(4 + i % 2))});
        writeRecording("drive.pcapng", "Ostrel_GSM", messages);
    }
    [[nodiscard]] ToolProcess::Setup onTerminal() const {
        ToolProcess::Setup setup = tool({"browse", path("drive.pcapng")});
        setup.onTerminal = true;
        setup.environment["LC_ALL"] = "C.UTF-8";
        return setup;
    }
    [[nodiscard]] static bool echoes(const ToolProcess& process) {
        termios settings = {};
        return ::tcgetattr(process.terminal(), &settings) == 0 && (settings.c_lflag & ECHO) != 0;
    }
};

TEST_F(BrowserTerminalTest, MovesSearchesAndRestores) {
    ToolProcess process(onTerminal());
    auto place = process.waitFor("message 1 of 40");
    ASSERT_TRUE(place);
    EXPECT_THAT(process.output(), StartsWith(enterScreen));
    EXPECT_FALSE(echoes(process));
    process.type("j");
    place = process.waitFor("message 2 of 40", *place);
    ASSERT_TRUE(place);
    process.type("\x1b[F");
    place = process.waitFor("message 40 of 40", *place);
    ASSERT_TRUE(place);
    process.type("/PLMN_LIST\r");
    place = process.waitFor("no later message has \"plmn_list\"", *place);
    ASSERT_TRUE(place);
    process.type("N");
    place = process.waitFor("message 39 of 40", *place);
    ASSERT_TRUE(place);
    process.type("y");
    ASSERT_TRUE(process.waitFor("\x1b]52;c;", *place));
    process.type("q");
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(process.output(), EndsWith(leaveScreen));
    EXPECT_TRUE(echoes(process));
}

TEST_F(BrowserTerminalTest, AsksBeforeNotesAreLost) {
    ToolProcess process(onTerminal());
    ASSERT_TRUE(process.waitFor("message 1 of 40"));
    process.resize(100, 24); // by default notes have no room
    process.type("mhandover?\r");
    ASSERT_TRUE(process.waitFor("* handover?"));
    process.type("q");
    ASSERT_TRUE(process.waitFor("notes are not written"));
    process.type("q");
    EXPECT_EQ(process.exitStatus(), 0);
}

TEST_F(BrowserTerminalTest, EndsWithTheSignalsOfAUserAndRestores) {
    for (const int number : {SIGINT, SIGTERM, SIGHUP, SIGQUIT}) {
        ToolProcess process(onTerminal());
        ASSERT_TRUE(process.waitFor("message 1 of 40"));
        process.signal(number);
        EXPECT_EQ(process.exitStatus(), 0) << number;
        EXPECT_THAT(process.output(), EndsWith(leaveScreen));
        EXPECT_TRUE(echoes(process));
    }
}

TEST_F(BrowserTerminalTest, ACrashRestoresTheTerminal) {
    ToolProcess process(onTerminal());
    ASSERT_TRUE(process.waitFor("message 1 of 40"));
    process.signal(SIGSEGV);
    EXPECT_EQ(process.exitStatus(), 128 + SIGSEGV);
    EXPECT_THAT(process.output(), EndsWith(leaveScreen));
    EXPECT_TRUE(echoes(process));
}

TEST_F(BrowserTerminalTest, StoppingLeavesTheTerminalUntilItContinues) {
    ToolProcess process(onTerminal());
    auto place = process.waitFor("message 1 of 40");
    ASSERT_TRUE(place);
    process.type("\x1a");
    place = process.waitFor(leaveScreen, *place);
    ASSERT_TRUE(place);
    // The settings follow the screen, and the event loop hears nothing of that.
    for (int i = 0; i < 4000 && !echoes(process); ++i)
        std::this_thread::sleep_for(std::chrono::milliseconds(10));
    EXPECT_TRUE(echoes(process));
    process.signal(SIGCONT);
    place = process.waitFor(enterScreen, *place);
    ASSERT_TRUE(place);
    ASSERT_TRUE(process.waitFor("message 1 of 40", *place));
    EXPECT_FALSE(echoes(process));
    process.type("q");
    EXPECT_EQ(process.exitStatus(), 0);
}

} // namespace
} // namespace velmora
