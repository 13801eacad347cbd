// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Record/RecordFixture.h"

#include <gmock/gmock.h>

#include <chrono>
#include <csignal>
#include <memory>
#include <string>
#include <vector>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;

/// What a recorder does when not all goes well: disk, service, or itself.
class RecordErrorTest : public RecordTest {
protected:
    [[nodiscard]] std::uintmax_t size() const { return std::filesystem::file_size(path("drive.pcapng")); }
    [[nodiscard]] std::string words(const std::vector<std::string>& lines) const {
        std::string text;
        for (const std::string& line : lines)
            text += "velmora-log: " + line + "\n";
        return text;
    }
    const std::string _file = path("drive.pcapng");
    const std::string _full = "cannot write " + _file + ": File too large";
    const std::string _waiting =
        _full + "; recording goes on when it can be, until then up to 32 MiB of messages wait";
    const std::string _gone = "the telephony service is gone; waiting for it";
};

TEST_F(RecordErrorTest, FileThatMayNotGrowIsWrittenWhenItMay) {
    startService();
    ToolProcess process(tool({"record", _file}));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(1));
    ASSERT_TRUE(fileHolds(1));
    // Room for the next block, of 52 bytes, and a part of another.
    const std::uintmax_t before = size();
    process.limitFileSize(before + 70);
    for (std::uint8_t state = 2; state <= 4; ++state)
        _service->send(rrState(state));
    ASSERT_TRUE(process.waitForError("velmora-log: " + _waiting + "\n"));
    EXPECT_TRUE(process.waitForError("<3>" + _waiting + "\n")) << "in the log as well";
    EXPECT_EQ(size(), before + 52);
    EXPECT_THAT(messagesOf("drive.pcapng", "Ostrel_GSM"), ElementsAre(rrState(1), rrState(2)));
    _service->send(rrState(5));
    process.limitFileSize(std::nullopt);
    ASSERT_TRUE(process.waitForError(_file + " can be written again; no messages were dropped\n"));
    _service->send(rrState(6));
    ASSERT_TRUE(fileHolds(6));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(ownMessages(process.errors()),
              words({_waiting, _file + " can be written again; no messages were dropped",
                     "recorded 6 messages of Ostrel_GSM, 102 bytes"}));
    EXPECT_THAT(messagesOf("drive.pcapng", "Ostrel_GSM"),
                ElementsAre(rrState(1), rrState(2), rrState(3), rrState(4), rrState(5), rrState(6)));
}

TEST_F(RecordErrorTest, MessagesBeyondTheQueueAreCounted) {
    startService();
    ToolProcess process(tool({"record", _file}));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(1));
    ASSERT_TRUE(fileHolds(1));
    process.limitFileSize(size());
    // Two such messages are 24 MiB; the third finds no room in 32.
    const Data large(std::vector<std::uint8_t>(12 << 20, 0x01));
    for (int i = 0; i < 3; ++i) {
        _service->send(large);
        ASSERT_TRUE(eventually([&] { return _service->isAllTaken(); }));
    }
    ASSERT_TRUE(process.waitForError("further ones are dropped\n"));
    process.limitFileSize(std::nullopt);
    ASSERT_TRUE(process.waitForError("can be written again"));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(
        ownMessages(process.errors()),
        words({_waiting, "32 MiB of messages wait for " + _file + "; further ones are dropped",
               _file + " can be written again; 1 messages were dropped",
               "recorded 3 messages of Ostrel_GSM, 25165841 bytes", "1 messages are missing from " + _file}));
    EXPECT_THAT(messagesOf("drive.pcapng", "Ostrel_GSM"), ElementsAre(rrState(1), large, large));
}

TEST_F(RecordErrorTest, UnsavedMessagesAreReportedAtTheEnd) {
    startService();
    ToolProcess::Setup setup = tool({"record", _file});
    setup.environment["GCOV_PREFIX"] = path("counts"); // a program that counts its coverage spoils its files
    ToolProcess process(setup);
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(1));
    ASSERT_TRUE(fileHolds(1));
    process.limitFileSize(size());
    _service->send(rrState(2));
    _service->send(rrState(3));
    ASSERT_TRUE(process.waitForError("messages wait\n"));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()),
              words({_waiting, _full, "recorded 1 messages of Ostrel_GSM, 17 bytes",
                     "2 messages are missing from " + _file}));
    EXPECT_THAT(messagesOf("drive.pcapng", "Ostrel_GSM"), ElementsAre(rrState(1)));
}

TEST_F(RecordErrorTest, LostAndRestartedServiceIsReported) {
    startService();
    ToolProcess process(tool({"record", _file}));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(1));
    ASSERT_TRUE(fileHolds(1));
    _service.reset();
    ASSERT_TRUE(process.waitForError("velmora-log: " + _gone + "\n"));
    EXPECT_TRUE(process.waitForError("<3>" + _gone + "\n")) << "in the log as well";
    startService();
    ASSERT_TRUE(process.waitForError("velmora-log: the telephony service is back\n"));
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(2));
    ASSERT_TRUE(fileHolds(2));
    process.signal(SIGTERM);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(ownMessages(process.errors()),
              words({_gone, "the telephony service is back", "recorded 2 messages of Ostrel_GSM, 34 bytes"}));
}

TEST_F(RecordErrorTest, EveryLossAndReturnIsReportedWithoutATechnology) {
    startService();
    ToolProcess process(tool({"record", _file}));
    ASSERT_TRUE(isStreaming());
    const std::string back =
        "the telephony service is back, without naming its technology; recording goes on "
        "as Ostrel_GSM";
    for (std::uint8_t round = 1; round <= 2; ++round) {
        const std::size_t before = ownMessages(process.errors()).size();
        _service.reset();
        ASSERT_TRUE(eventually([&] { return ownMessages(process.errors()).size() > before; }));
        startService("");
        ASSERT_TRUE(isStreaming());
        _service->send(rrState(round));
        ASSERT_TRUE(fileHolds(round));
    }
    _service.reset();
    startService();
    ASSERT_TRUE(process.waitForError("the telephony service is back\n"));
    process.signal(SIGTERM);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(ownMessages(process.errors()),
              words({_gone, back, _gone, back, _gone, "the telephony service is back",
                     "recorded 2 messages of Ostrel_GSM, 34 bytes"}));
}

TEST_F(RecordErrorTest, RestartBetweenTwoChecksIsReported) {
    startService();
    ToolProcess process(tool({"record", _file}));
    ASSERT_TRUE(isStreaming());
    _service.reset();
    startService(""); // before the recorder can have noticed
    ASSERT_TRUE(isStreaming());
    ASSERT_TRUE(process.waitForError("recording goes on as Ostrel_GSM\n"));
    process.signal(SIGTERM);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(ownMessages(process.errors()),
                testing::StartsWith(words({_gone}) + "velmora-log: the telephony service is back, without"));
}

TEST_F(RecordErrorTest, TerminalShowsProgress) {
    ToolProcess::Setup setup = tool({"record", "--log-level", "0", _file});
    setup.onTerminal = true;
    setup.errorsOnTerminal = true;
    startService();
    ToolProcess process(setup);
    ASSERT_TRUE(isStreaming());
    _service->send(rrState(1));
    const auto progress = process.waitFor("\r\x1b[K1 messages, 17 bytes, ");
    ASSERT_TRUE(progress);
    ASSERT_TRUE(process.waitFor(" s\r\x1b[K", *progress)) << "the line is written over";
    process.limitFileSize(size());
    _service->send(rrState(2));
    // A report has a line of its own, with the progress below it.
    const auto told = process.waitFor("\r\x1b[Kvelmora-log: " + _waiting + "\r\n", *progress);
    ASSERT_TRUE(told);
    ASSERT_TRUE(process.waitFor("2 messages, 34 bytes, ", *told));
    ASSERT_TRUE(process.waitFor(" s; 1 wait to be written", *told));
    process.limitFileSize(std::nullopt);
    const auto again = process.waitFor("can be written again; no messages were dropped\r\n", *told);
    ASSERT_TRUE(again);
    _service.reset();
    const auto gone = process.waitFor("velmora-log: " + _gone + "\r\n", *again);
    ASSERT_TRUE(gone);
    ASSERT_TRUE(process.waitFor(" s; waiting for the telephony service", *gone));
    process.signal(SIGINT);
    EXPECT_EQ(process.exitStatus(), 0);
    const std::string rest = process.output().substr(process.output().rfind("\x1b[K") + 3);
    EXPECT_THAT(rest, testing::HasSubstr("velmora-log: recorded 2 messages of Ostrel_GSM, 34 bytes\r\n"));
    EXPECT_THAT(rest, testing::Not(testing::HasSubstr("bytes, "))) << "the progress is gone";
}

TEST_F(RecordErrorTest, KilledRecorderLosesTheLastSecondAtMost) {
    using Instant = std::chrono::steady_clock::time_point;
    struct Victim {
        std::string name;
        std::chrono::milliseconds killedAfter;
        std::unique_ptr<ToolProcess> process;
        Instant killed{};
    };
    std::vector<Victim> victims;
    for (const auto delay : {120ms, 490ms, 760ms, 1040ms, 1550ms, 2280ms})
        victims.push_back({std::to_string(delay.count()) + ".pcapng", delay, nullptr});
    startService();
    for (Victim& victim : victims)
        victim.process = std::make_unique<ToolProcess>(tool({"record", path(victim.name)}));
    ASSERT_TRUE(isStreaming(victims.size()));

    // A message every 5 ms with its number; the victims die one by one.
    std::vector<Instant> sent;
    std::size_t dead = 0;
    const Instant start = std::chrono::steady_clock::now();
    LoopTimer sender([&] {
        const auto number = static_cast<std::uint16_t>(sent.size());
        const std::uint8_t payload[] = {static_cast<std::uint8_t>(number),
                                        static_cast<std::uint8_t>(number >> 8)};
        sent.push_back(std::chrono::steady_clock::now());
        _service->send(recordOf(0x512C, payload));
        for (Victim& victim : victims) {
            if (victim.killed != Instant() || sent.back() - start < victim.killedAfter)
                continue;
            victim.killed = std::chrono::steady_clock::now();
            victim.process->signal(SIGKILL);
            ++dead;
        }
    });
    sender.startRepeating(5ms);
    ASSERT_TRUE(eventually([&] { return dead == victims.size(); }));

    for (Victim& victim : victims) {
        EXPECT_EQ(victim.process->exitStatus(), 128 + SIGKILL);
        const auto reader = openMessages(path(victim.name));
        ASSERT_TRUE(reader) << victim.name << ": " << reader.reason();
        std::size_t count = 0;
        while (const auto message = (*reader)->next()) {
            const Bytes bytes = message->message.bytes();
            ASSERT_EQ(bytes.size(), 15U);
            ASSERT_EQ(bytes[13] + 256U * bytes[14], count) << victim.name;
            ++count;
        }
        // The kill may have cut the write that it met.
        for (const Loss& loss : (*reader)->losses())
            EXPECT_TRUE(loss.isTruncation) << victim.name << ": " << loss.reason;
        std::size_t due = 0;
        while (due < sent.size() && sent[due] < victim.killed - std::chrono::seconds(1))
            ++due;
        EXPECT_GE(count, due) << victim.name;
    }
}

} // namespace
} // namespace velmora
