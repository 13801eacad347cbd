// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Watch/WatchCommandFixture.h"

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;

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
    const std::string advice =
        "; mend that, or name another directory in VELMORA_PORT_DIR, for the service too\n";
    EXPECT_EQ(ownMessages(process.errors()), problem + advice + problem + " after 0.3 s" + advice);
}

TEST_F(WatchCommandTest, ATechnologyWithoutADecoderIsReported) {
    startService("Ostrel_NR");
    ToolProcess process(tool({"watch"}));
    EXPECT_TRUE(process.waitForError(
        "velmora-log: the telephony service's technology Ostrel_NR has no decoder here, wanted one of IFX, "
        "Ostrel_GSM, Ostrel_CDMA, Ostrel_LTE, Ostrel_UTRAN2, Modem; start the service with another "
        "source\n"));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 0);
}

TEST_F(WatchCommandTest, AServiceThatNamesNoTechnologyIsReportedOnce) {
    startService("");
    ToolProcess process(tool({"watch"}));
    const std::string line = "velmora-log: the telephony service does not name its technology; it may have "
                             "no modem yet, which its "
                             "own log says; if it has, restart it\n";
    EXPECT_TRUE(process.waitForError(line));
    ASSERT_TRUE(process.waitFor("Connecting...\n"));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(ownMessages(process.errors()), line);
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

} // namespace
} // namespace velmora
