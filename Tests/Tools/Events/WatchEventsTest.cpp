// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Events/EventsFixture.h"
#include "Tests/Tools/FakeLogService.h"
#include "Tools/Watch/TerminalFrame.h"

#include <csignal>
#include <optional>

namespace velmora {
namespace {

using testing::HasSubstr;
using testing::Not;

const std::string tail = "\x1b[7ms"; // of the status line

TEST(EventLineTest, IsAboveTheStatusAndTakesARow) {
    const ScreenSize size{30, 8};
    EXPECT_EQ(withoutEvents(size, "lost").rows, 7U);
    const std::string frame = composeFrame({{"row", false}}, "s", size, 0, "lost");
    std::string expected = "\x1b[Hrow\x1b[K\r\n";
    for (int i = 0; i < 5; ++i)
        expected += "\x1b[K\r\n";
    expected += "lost\x1b[K\r\n\x1b[7ms" + std::string(29, ' ') + "\x1b[0m";
    EXPECT_EQ(frame, expected);
}

TEST(EventLineTest, IsCutAtTheWidthOfTheWindow) {
    EXPECT_THAT(composeFrame({}, "s", {30, 8}, 0, "0123456789012345678901234567890123"),
                HasSubstr("\r\n01234567890123456789012345678\u2026\r\n" + tail));
    EXPECT_THAT(composeFrame({}, "s", {30, 8}, 0, "012345678901234567890123456789"),
                HasSubstr("\r\n012345678901234567890123456789\r\n" + tail)); // as wide as the window
}

TEST(EventLineTest, SmallWindowsHaveNone) {
    for (const ScreenSize size : {ScreenSize{30, 7}, ScreenSize{29, 8}}) {
        EXPECT_EQ(withoutEvents(size, "lost").rows, size.rows);
        EXPECT_EQ(composeFrame({{"row", false}}, "s", size, 0, "lost"),
                  composeFrame({{"row", false}}, "s", size, 0));
    }
    EXPECT_EQ(withoutEvents({80, 24}, "").rows, 24U);
}

class WatchEventsTest : public EventsTest {
protected:
    [[nodiscard]] ToolProcess::Setup onTerminal(std::vector<std::string> arguments) const {
        ToolProcess::Setup setup = shipped(std::move(arguments));
        setup.onTerminal = true;
        return setup;
    }
    void startService() { _service.emplace(_directory / "ports", "Ostrel_GSM"); }
    [[nodiscard]] bool isStreaming() {
        return eventually([&] { return _service->streaming() >= 1; });
    }

    std::optional<FakeLogService> _service;
};

TEST_F(WatchEventsTest, TheLatestEventsAreALineOnTheScreen) {
    startService();
    ToolProcess process(onTerminal({"watch"}));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(4));
    _service->send(rrState(5));
    EXPECT_TRUE(process.waitFor(" RR: RR_PLMN_LIST_CONSTRUCTION to RR_IDLE"));
    _service->send(rrState(4));
    const auto end = process.waitFor(" RR: RR_IDLE to RR_PLMN_LIST_CONSTRUCTION");
    ASSERT_TRUE(end);
    EXPECT_TRUE(process.waitFor("\u2026", *end)); // the earlier one after it, as far as there is room
    EXPECT_THAT(process.output(), Not(HasSubstr("\a")));
    process.type("q");
    EXPECT_EQ(process.exitStatus(), 0);
}

TEST_F(WatchEventsTest, TheBellRingsForEventsThatAreSevereEnough) {
    startService();
    ToolProcess quiet(onTerminal({"watch", "--bell"})); // warning
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(4));
    _service->send(rrState(5));
    ASSERT_TRUE(quiet.waitFor("to RR_IDLE"));
    const std::uint8_t tooShort[] = {0x01};
    _service->send(recordOf(0x512C, tooShort)); // malformed, which is a warning
    EXPECT_TRUE(quiet.waitFor("\a"));
    EXPECT_EQ(quiet.output().find('\a'), quiet.output().rfind('\a'));
    quiet.type("q");
    EXPECT_EQ(quiet.exitStatus(), 0);
}

} // namespace
} // namespace velmora
