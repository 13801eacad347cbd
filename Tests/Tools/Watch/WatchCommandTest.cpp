// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/FakeLogService.h"
#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <chrono>
#include <csignal>
#include <filesystem>
#include <optional>
#include <regex>

#include <termios.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;

constexpr const char* enterScreen = "\x1b[?1049h\x1b[?25l";
constexpr const char* leaveScreen = "\x1b[?25h\x1b[?1049l";

const std::string noService =
    "velmora-log: no telephony service answers; start one with velmora-telephonyd --source modemmanager (the "
    "modem) or velmora-telephonyd --source scenario:gsm,seed=1 (a synthetic drive)\n";

/// The text with every status line's time as "TIME".
std::string withoutTimes(const std::string& text) {
    static const std::regex time("Updated [0-9]{4}-[0-9]{2}-[0-9]{2} at [0-9]{2}:[0-9]{2}:[0-9]{2}");
    return std::regex_replace(text, time, "Updated TIME");
}

class WatchCommandTest : public ToolTest {
protected:
    void startService(const std::string& technology = "IFX") {
        _service.emplace(_directory / "ports", technology);
    }
    /// Waits until so many start commands have come; more where the program has not waited for an answer.
    [[nodiscard]] bool isStreaming(std::size_t clients = 1) {
        return eventually([&] { return _service->streaming() >= clients; });
    }
    /// Sends the message until the program shows the text.
    [[nodiscard]] bool isShownFor(const Data& message, const ToolProcess& process, const std::string& text) {
        for (int i = 0; i < 20; ++i) {
            _service->send(message);
            if (testLoop().runUntil([&] { return process.output().find(text) != std::string::npos; },
                                    std::chrono::seconds(3)))
                return true;
        }
        return false;
    }
    void sendBand(const std::string& band) {
        const DictionaryRef display = makeDictionary();
        display->set("Band", band);
        _service->send(serialized(display));
    }
    [[nodiscard]] ToolProcess::Setup onTerminal(std::vector<std::string> arguments) const {
        ToolProcess::Setup setup = tool(std::move(arguments));
        setup.onTerminal = true;
        return setup;
    }

    std::optional<FakeLogService> _service;
};

TEST_F(WatchCommandTest, PipeGetsEachRefreshAndTheLossOfTheConnection) {
    startService();
    ToolProcess process(tool({"watch"}));
    ASSERT_TRUE(isStreaming());
    sendBand("GSM 900");
    ASSERT_TRUE(process.waitFor("Band  GSM 900\n"));
    sendBand("GSM 1800");
    ASSERT_TRUE(process.waitFor("Band  GSM 1800\n"));
    _service.reset();
    ASSERT_TRUE(process.waitFor("Connecting...\n"));
    startService();
    ASSERT_TRUE(isStreaming());
    sendBand("GSM 850");
    ASSERT_TRUE(process.waitFor("Band  GSM 850\n"));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(withoutTimes(process.output()), "Updated TIME\nBand  GSM 900\n"
                                              "\n"
                                              "Updated TIME\nBand  GSM 1800\n"
                                              "\n"
                                              "Connecting...\n"
                                              "\n"
                                              "Updated TIME\nBand  GSM 850\n");
    _service.reset();
    EXPECT_THAT(portFiles(), ElementsAre());
}

TEST_F(WatchCommandTest, ShowsAnotherTechnologyWhenTheModemChangesToIt) {
    startService();
    ToolProcess process(tool({"watch"}));
    ASSERT_TRUE(isStreaming());
    sendBand("GSM 900");
    ASSERT_TRUE(process.waitFor("Band  GSM 900\n"));
    _service.reset();
    startService("Ostrel_GSM");
    // It connects once as before, which the service may be too late to see, and once more with a display of
    // its own.
    ASSERT_TRUE(isShownFor(rrState(5), process, "RR State      RR_IDLE\n"));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(process.output(), EndsWith("GSM RR Info\n"
                                           "  RR State      RR_IDLE\n"
                                           "  RR Sub State  0\n"
                                           "  RR Status     1\n"
                                           "  RR Mode       Voice\n"
                                           "UMTS RR Info\n"
                                           "SIM Info\n"));
    _service.reset();
    EXPECT_THAT(portFiles(), ElementsAre());
}

TEST_F(WatchCommandTest, WithoutAServiceItWaits) {
    ToolProcess process(tool({"watch"}));
    ASSERT_TRUE(process.waitFor("Connecting...\n"));
    process.signal(SIGTERM);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), "Connecting...\n");
    EXPECT_EQ(ownMessages(process.errors()), noService);
    EXPECT_THAT(portFiles(), ElementsAre());
}

TEST_F(WatchCommandTest, OncePrintsTheFirstRefreshAndEnds) {
    startService("Ostrel_GSM");
    ToolProcess process(tool({"watch", "--once"}));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(5));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(withoutTimes(process.output()), "Updated TIME\n"
                                              "GSM RR Info\n"
                                              "  RR State      RR_IDLE\n"
                                              "  RR Sub State  0\n"
                                              "  RR Status     1\n"
                                              "  RR Mode       Voice\n"
                                              "UMTS RR Info\n"
                                              "SIM Info\n");
}

TEST_F(WatchCommandTest, OnceEndsAfterItsTimeoutWithoutAService) {
    ToolProcess process(tool({"watch", "--once", "--timeout", "0.3"}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(), "");
    EXPECT_THAT(process.errors(),
                HasSubstr("velmora-log: no telephony service answers after 0.3 s; start one with "
                          "velmora-telephonyd --source "));
}

TEST_F(WatchCommandTest, OnceEndsAfterItsTimeoutWithoutAMessage) {
    startService();
    ToolProcess process(tool({"watch", "--once", "--timeout", "0.5"}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(), "");
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: the telephony service has sent nothing after 0.5 s\n");
}

TEST_F(WatchCommandTest, OnceWithARefreshInTimeIsNoError) {
    startService();
    ToolProcess process(tool({"watch", "--once", "--timeout", "30"}));
    ASSERT_TRUE(isStreaming());
    sendBand("GSM 900");
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(process.output(), EndsWith("Band  GSM 900\n"));
}

TEST_F(WatchCommandTest, AnUnusablePortDirectoryIsReported) {
    std::filesystem::permissions(_directory / "ports", std::filesystem::perms::all);
    ToolProcess process(tool({"watch", "--once", "--timeout", "0.3"}));
    EXPECT_EQ(process.exitStatus(), 1);
    const std::string problem =
        "velmora-log: port directory " + path("ports") + " has mode 0777, wanted 0700";
    EXPECT_EQ(ownMessages(process.errors()), problem + "\n" + problem + " after 0.3 s\n");
}

TEST_F(WatchCommandTest, ATechnologyWithoutADecoderIsReported) {
    startService("Ostrel_NR");
    ToolProcess process(tool({"watch"}));
    EXPECT_TRUE(process.waitForError(
        "velmora-log: the telephony service's technology Ostrel_NR has no decoder here, wanted one of IFX, "
        "Ostrel_GSM, Ostrel_CDMA, Ostrel_LTE, Ostrel_UTRAN2\n"));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 0);
}

TEST_F(WatchCommandTest, ClosedPipeEndsItQuietlyWithoutARefresh) {
    startService();
    ToolProcess process(tool({"watch"}));
    ASSERT_TRUE(isStreaming());
    process.stopReading();
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(ownMessages(process.errors()), "");
}

TEST_F(WatchCommandTest, FullDiskIsReported) {
    ToolProcess::Setup setup = tool({"watch"});
    setup.outputFile = "/dev/full";
    ToolProcess process(setup);
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()),
              noService + "velmora-log: cannot write standard output: No space left on device\n");
}

TEST_F(WatchCommandTest, DecoderLinesAreSummedUpWhenItEnds) {
    startService("Ostrel_GSM");
    ToolProcess process(tool({"watch"}));
    ASSERT_TRUE(isStreaming());
    for (int i = 0; i < 3; ++i)
        _service->send(record(0x512C, "04 00 01 00", 2));
    _service->send(rrState(5));
    ASSERT_TRUE(process.waitFor("RR_IDLE"));
    EXPECT_EQ(process.errors(), "");
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.errors(), "<3>3 times: Invalid log type: 2. Dropping.\n");
}

TEST_F(WatchCommandTest, VerboseWritesDecoderLinesAsTheyArise) {
    startService("Ostrel_GSM");
    ToolProcess process(tool({"watch", "-v"}));
    ASSERT_TRUE(process.waitForError("<3>Creating Ostrel_GSMLogGenerator object\n"));
    ASSERT_TRUE(isStreaming());
    _service->send(record(0x512C, "04 00 01 00", 2));
    ASSERT_TRUE(process.waitForError("<3>Invalid log type: 2. Dropping.\n"));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(process.errors(), HasSubstr("Deallocing Ostrel_GSMClassIndex\n"));
}

TEST_F(WatchCommandTest, SeveralWatchersRunAtOnce) {
    startService();
    ToolProcess one(tool({"watch", "--once"}));
    ToolProcess other(tool({"watch", "--once"}));
    ASSERT_TRUE(isStreaming(2));
    sendBand("GSM 900");
    EXPECT_EQ(one.exitStatus(), 0);
    EXPECT_EQ(other.exitStatus(), 0);
    EXPECT_THAT(one.output(), EndsWith("\nBand  GSM 900\n"));
    EXPECT_THAT(other.output(), EndsWith("\nBand  GSM 900\n"));
}

TEST_F(WatchCommandTest, UnreadableSimFilesEndTheProgramWithTheirMessage) {
    startService("Ostrel_GSM");
    ToolProcess process(onTerminal({"watch"}));
    ASSERT_TRUE(isStreaming());
    _service->send(record(0x0000, "DE AD BE EF", 0xFF));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: the telephony service: SIM File dictionary data could not be constructed\n");
    EXPECT_THAT(process.output(), EndsWith(leaveScreen));
    _service.reset();
    EXPECT_THAT(portFiles(), ElementsAre());
}

TEST_F(WatchCommandTest, OnATerminalTheSumComesAfterTheScreen) {
    startService("Ostrel_GSM");
    ToolProcess::Setup setup = onTerminal({"watch"});
    setup.errorsOnTerminal = true;
    ToolProcess process(setup);
    ASSERT_TRUE(isStreaming());
    for (int i = 0; i < 2; ++i)
        _service->send(record(0x512C, "04 00 01 00", 2));
    _service->send(rrState(5));
    ASSERT_TRUE(process.waitFor("RR_IDLE"));
    EXPECT_THAT(process.output(), Not(HasSubstr("<3>")));
    process.type("q");
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(process.output(),
                EndsWith(std::string(leaveScreen) + "<3>2 times: Invalid log type: 2. Dropping.\r\n"));
}

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
    ASSERT_TRUE(process.waitFor("Connecting... no telephony service answers", *refreshed));
    EXPECT_THAT(process.output().substr(process.output().rfind("\x1b[H")), StartsWith("\x1b[HRow 0 "));
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
