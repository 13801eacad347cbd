// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Record/RecordFixture.h"

#include <gmock/gmock.h>

#include <chrono>
#include <csignal>
#include <fstream>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::EndsWith;

class RecordCommandTest : public RecordTest {};

TEST_F(RecordCommandTest, RecordsWhatArrivesUntilInterrupted) {
    startService();
    ToolProcess process(tool({"record", path("drive.pcapng")}));
    ASSERT_TRUE(isStreaming());
    // Neither is decodable, and one would end a decoder: a recorder takes them as they are.
    _service->send(rrState(5));
    _service->send(record(0x0000, "DE AD BE EF", 0xFF));
    _service->send(hex("01 02"));
    ASSERT_TRUE(fileHolds(3));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(process.output(), "");
    EXPECT_EQ(ownMessages(process.errors()), "velmora-log: recorded 3 messages of Ostrel_GSM, 36 bytes\n");
    EXPECT_THAT(messagesOf("drive.pcapng", "Ostrel_GSM"),
                ElementsAre(rrState(5), record(0x0000, "DE AD BE EF", 0xFF), hex("01 02")));
    _service.reset();
    EXPECT_THAT(portFiles(), ElementsAre());
}

TEST_F(RecordCommandTest, DecodesToWhatAWatcherOfTheSameStreamShowed) {
    startService();
    ToolProcess watcher(tool({"watch"}));
    ToolProcess recorder(tool({"record", "--count", "3", path("drive.pcapng")}));
    ASSERT_TRUE(isStreaming(2));
    _service->send(rrState(4));
    _service->send(record(0x4125, "03"));
    _service->send(rrState(5));
    EXPECT_EQ(recorder.exitStatus(), 0);
    ASSERT_TRUE(watcher.waitFor("RR_IDLE"));
    ASSERT_TRUE(watcher.waitFor("SIM Info\n"));
    ToolProcess decoder(tool({"decode", path("drive.pcapng")}));
    ASSERT_EQ(decoder.exitStatus(), 0);
    EXPECT_THAT(decoder.output(), testing::HasSubstr("  RR State      RR_IDLE\n"));
    EXPECT_THAT(decoder.output(), testing::HasSubstr("UMTS RR Info\n  RRC State  "));
    EXPECT_THAT(watcher.output(), EndsWith("\n" + decoder.output()));
}

TEST_F(RecordCommandTest, CountIsExact) {
    startService();
    ToolProcess process(tool({"record", "--count", "2", path("drive.pcapng")}));
    ASSERT_TRUE(isStreaming());
    for (std::uint8_t state = 1; state <= 4; ++state)
        _service->send(rrState(state));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(messagesOf("drive.pcapng", "Ostrel_GSM"), ElementsAre(rrState(1), rrState(2)));
}

TEST_F(RecordCommandTest, CountEndsWithTheSource) {
    startService();
    ToolProcess process(tool({"record", "--count", "3", path("drive.pcapng")}));
    ToolProcess open(tool({"record", "--duration", "1.5", path("open.pcapng")}));
    ASSERT_TRUE(isStreaming(2));
    _service->send(rrState(1));
    _service->send(rrState(2));
    _service->sendEnd();
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: the telephony service's source has ended after 2 of 3 messages\n"
              "velmora-log: recorded 2 messages of Ostrel_GSM, 34 bytes\n");
    EXPECT_THAT(messagesOf("drive.pcapng", "Ostrel_GSM"), ElementsAre(rrState(1), rrState(2)));
    // Without a number of messages there is nothing that can no longer be reached.
    EXPECT_EQ(open.exitStatus(), 0);
    EXPECT_EQ(ownMessages(open.errors()), "velmora-log: recorded 2 messages of Ostrel_GSM, 34 bytes\n");
}

TEST_F(RecordCommandTest, DurationEndsARecordingWithoutMessages) {
    startService();
    ToolProcess process(tool({"record", "--duration", "0.2", path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(ownMessages(process.errors()), "velmora-log: recorded 0 messages of Ostrel_GSM, 0 bytes\n");
    EXPECT_THAT(messagesOf("drive.pcapng", "Ostrel_GSM"), ElementsAre());
}

TEST_F(RecordCommandTest, APipeGetsEachMessageAsItArrives) {
    startService();
    ToolProcess process(tool({"record", "-"}));
    ASSERT_TRUE(isStreaming());
    const auto started = std::chrono::steady_clock::now();
    for (std::uint8_t number = 0; number < 10; ++number) {
        const std::string text = "message " + std::to_string(number);
        _service->send(Data(std::vector<std::uint8_t>(text.begin(), text.end())));
        ASSERT_TRUE(process.waitFor(text));
    }
    // A file gets them twice a second, which would be 5 s.
    EXPECT_LT(std::chrono::steady_clock::now() - started, std::chrono::seconds(2));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 0);
}

TEST_F(RecordCommandTest, WithoutAServiceItEndsAfterItsTimeout) {
    ToolProcess process(tool({"record", "--timeout", "0.3", path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: no telephony service answers; retrying\n"
              "velmora-log: nothing was recorded: no telephony service answers after 0.3 s; start one with "
              "velmora-telephonyd --source modemmanager (the modem) or velmora-telephonyd --source "
              "scenario:gsm,seed=1 (a synthetic drive)\n");
    EXPECT_FALSE(exists("drive.pcapng"));
}

TEST_F(RecordCommandTest, ATimeoutDoesNotEndARecordingThatHasBegun) {
    startService();
    ToolProcess process(tool({"record", "--timeout", "0.3", "--duration", "0.6", path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(ownMessages(process.errors()), "velmora-log: recorded 0 messages of Ostrel_GSM, 0 bytes\n");
}

TEST_F(RecordCommandTest, WithoutAServiceNoFileIsLeft) {
    ToolProcess process(tool({"record", "--duration", "0.2", path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: no telephony service answers; retrying\n"
              "velmora-log: nothing was recorded: the telephony service has named no technology\n");
    EXPECT_FALSE(exists("drive.pcapng"));
}

TEST_F(RecordCommandTest, FileThatIsThereIsKeptUnlessForced) {
    std::ofstream(path("drive.pcapng"))
        << "an earlier recording, longer than the new one would be: " << std::string(1000, '.');
    const std::string before = contentOf("drive.pcapng");
    ToolProcess refused(tool({"record", path("drive.pcapng")}));
    EXPECT_EQ(refused.exitStatus(), 1);
    EXPECT_EQ(ownMessages(refused.errors()),
              "velmora-log: " + path("drive.pcapng") + " is there already; --force overwrites it\n");
    EXPECT_EQ(contentOf("drive.pcapng"), before);

    // Without a service there is nothing to overwrite it with.
    ToolProcess lonely(tool({"record", "--force", "--duration", "0.2", path("drive.pcapng")}));
    EXPECT_EQ(lonely.exitStatus(), 1);
    EXPECT_EQ(contentOf("drive.pcapng"), before);

    startService();
    ToolProcess forced(tool({"record", "--force", "--count", "1", path("drive.pcapng")}));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(5));
    EXPECT_EQ(forced.exitStatus(), 0);
    EXPECT_THAT(messagesOf("drive.pcapng", "Ostrel_GSM"), ElementsAre(rrState(5)));
}

TEST_F(RecordCommandTest, UncreatableFileIsReportedImmediately) {
    ToolProcess process(tool({"record", path("nowhere/drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: cannot create " + path("nowhere/drive.pcapng") + ": No such file or directory\n");
}

TEST_F(RecordCommandTest, FullDiskIsReportedImmediately) {
    startService();
    ToolProcess process(tool({"record", "/dev/full"}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: cannot write /dev/full: No space left on device\n");
}

TEST_F(RecordCommandTest, AnotherTechnologyEndsTheRecording) {
    startService();
    ToolProcess process(tool({"record", path("drive.pcapng")}));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(5));
    ASSERT_TRUE(fileHolds(1));
    _service.reset();
    startService("IFX");
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: the telephony service is gone; waiting for it\n"
              "velmora-log: the telephony service now speaks IFX, the recording is of Ostrel_GSM\n"
              "velmora-log: recorded 1 messages of Ostrel_GSM, 17 bytes\n");
    EXPECT_THAT(messagesOf("drive.pcapng", "Ostrel_GSM"), ElementsAre(rrState(5)));
}

TEST_F(RecordCommandTest, TechnologyWithoutADecoderIsReported) {
    startService("Nonesuch");
    ToolProcess process(tool({"record", path("drive.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: the telephony service speaks Nonesuch, which has no decoder "
              "here, wanted one of IFX, Ostrel_GSM, Ostrel_CDMA, Ostrel_LTE, "
              "Ostrel_UTRAN2, Modem\n");
    EXPECT_FALSE(exists("drive.pcapng"));
}

TEST_F(RecordCommandTest, DashIsStandardOutput) {
    startService();
    ToolProcess recorder(tool({"record", "--count", "1", "-"}));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(5));
    ASSERT_EQ(recorder.exitStatus(), 0);
    ToolProcess::Setup setup = tool({"decode", "-"});
    setup.input = recorder.output();
    ToolProcess decoder(setup);
    EXPECT_EQ(decoder.exitStatus(), 0);
    EXPECT_THAT(decoder.output(), testing::StartsWith("GSM RR Info\n  RR State      RR_IDLE\n"));
}

TEST_F(RecordCommandTest, ClosedStandardErrorDoesNotEndUpInTheRecording) {
    startService();
    ToolProcess::Setup setup = tool({"-c", "exec \"$0\" record --count 1 \"$1\" <&- >&- 2>&-",
                                     VELMORA_BUILD_DIR "/velmora-log", path("drive.pcapng")});
    ToolProcess process(setup, "/bin/sh");
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(5));
    ASSERT_TRUE(fileHolds(1));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(messagesOf("drive.pcapng", "Ostrel_GSM"), ElementsAre(rrState(5)));
}

TEST_F(RecordCommandTest, ClosedPipeEndsItQuietly) {
    startService();
    ToolProcess process(tool({"record", "-"}));
    ASSERT_TRUE(isStreaming());
    process.stopReading();
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(ownMessages(process.errors()), "velmora-log: recorded 0 messages of Ostrel_GSM, 0 bytes\n");
}

} // namespace
} // namespace velmora
