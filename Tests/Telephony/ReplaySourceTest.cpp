// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Sources/ReplaySource.h"

#include "Recording/Pcapng/PcapngWriter.h"
#include "Telephony/Sources/SourceFactory.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeMainQueue.h"
#include "Tests/Support/Hex.h"
#include "Tests/Support/TemporaryDirectory.h"
#include "Tests/Telephony/TelephonyTesting.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>
#include <utility>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

/// The content of a file, set by the test.
struct FakeFile {
    std::string technology = "Ostrel_GSM";
    std::vector<std::pair<std::chrono::nanoseconds, Data>> messages; ///< by time since some hour
    std::vector<Loss> losses;                                        ///< reported at the end
    std::optional<Failure> failure;                                  ///< the end's
};

class FakeReader final : public MessageReader {
public:
    explicit FakeReader(const FakeFile& file) : _file(file) {}

    [[nodiscard]] std::optional<LoggedMessage> next() override {
        if (_next < _file.messages.size()) {
            const auto& [time, message] = _file.messages[_next++];
            return LoggedMessage{FakeClock::defaultNow() + time, message, _next, 0};
        }
        if (!std::exchange(_ended, true))
            for (const Loss& loss : _file.losses)
                addLoss(loss);
        return std::nullopt;
    }
    [[nodiscard]] const std::string& technology() const override { return _file.technology; }
    [[nodiscard]] const std::optional<Failure>& failure() const override {
        return _ended ? _file.failure : _none;
    }

private:
    const FakeFile& _file;
    std::size_t _next = 0;
    bool _ended = false;
    std::optional<Failure> _none;
};

class ReplaySourceTest : public ::testing::Test {
protected:
    ReplaySource& make(const ReplaySource::Options& options = {}) {
        auto made = ReplaySource::create(
            queue, clock, "drive.pcapng",
            [this]() -> Result<std::unique_ptr<MessageReader>> {
                ++opened;
                if (unreadable)
                    return Failure{"is not there"};
                return std::unique_ptr<MessageReader>(std::make_unique<FakeReader>(file));
            },
            options);
        if (!made)
            throw std::runtime_error(made.reason());
        source = *std::move(made);
        return *source;
    }

    FakeClock clock;
    FakeMainQueue queue{clock};
    CollectingSink sink;
    CapturedLog log;
    FakeFile file;
    bool unreadable = false;
    int opened = 0;
    std::unique_ptr<ReplaySource> source;
};

TEST_F(ReplaySourceTest, playsAtTheFilesPace) {
    const Data a = hex("01");
    const Data b = hex("02");
    const Data c = hex("03");
    file.messages = {{5min, a}, {5min + 200ms, b}, {5min + 10s, c}};
    ReplaySource& replay = make();
    EXPECT_EQ(replay.technology(), "kVoxLogChannelTechnology_Ostrel_GSM");
    replay.start(sink);
    queue.advance(1ms);
    EXPECT_THAT(sink.messages, ElementsAre(a)) << "the first comes at once";
    queue.advance(198ms);
    EXPECT_THAT(sink.messages, ElementsAre(a));
    queue.advance(2ms);
    EXPECT_THAT(sink.messages, ElementsAre(a, b));
    queue.advance(10s);
    EXPECT_THAT(sink.messages, ElementsAre(a, b, c));
    EXPECT_TRUE(log.contains(LogPriority::Notice, "drive.pcapng: played to the end, 3 messages"));
}

TEST_F(ReplaySourceTest, eachStartBeginsAtTheBeginning) {
    file.messages = {{0s, hex("01")}, {1s, hex("02")}, {2s, hex("03")}};
    ReplaySource& replay = make();
    replay.start(sink);
    queue.advance(1500ms);
    replay.stop();
    queue.advance(10s);
    EXPECT_THAT(sink.messages, ElementsAre(hex("01"), hex("02")));
    sink.messages.clear();
    replay.start(sink);
    queue.advance(10s);
    EXPECT_THAT(sink.messages, ElementsAre(hex("01"), hex("02"), hex("03")));
}

TEST_F(ReplaySourceTest, playsFasterOrAsFastAsThereIsRoom) {
    for (int second = 0; second < 100; ++second)
        file.messages.emplace_back(std::chrono::seconds(second), hex("01"));
    make({10, false}).start(sink);
    queue.advance(5s + 50ms);
    EXPECT_EQ(sink.messages.size(), 51U);
    source->stop();

    sink.messages.clear();
    make({0, false}).start(sink);
    queue.advance(10ms);
    EXPECT_EQ(sink.messages.size(), 100U);
}

TEST_F(ReplaySourceTest, loops) {
    file.messages = {{0s, hex("01")}, {2s, hex("02")}};
    make({1, true}).start(sink);
    queue.advance(2s + 10ms);
    EXPECT_EQ(sink.messages.size(), 2U);
    queue.advance(900ms);
    EXPECT_EQ(sink.messages.size(), 2U);
    queue.advance(100ms);
    EXPECT_THAT(sink.messages, ElementsAre(hex("01"), hex("02"), hex("01"))) << "a second later";
    queue.advance(27s);
    // Up to 30.01 s: at 0, 3 ... 30 and at 2, 5 ... 29.
    EXPECT_EQ(sink.messages.size(), 21U);
    EXPECT_THAT(log.textsAt(LogPriority::Notice), IsEmpty()) << "it never ends";
}

TEST_F(ReplaySourceTest, anEmptyFileDoesNotLoop) {
    make({0, true}).start(sink);
    queue.advance(1min);
    EXPECT_EQ(opened, 2) << "once to look, once to play";
    EXPECT_EQ(queue.delayedCount(), 0U);
    EXPECT_TRUE(log.contains(LogPriority::Notice, "drive.pcapng: holds no message"));
}

TEST_F(ReplaySourceTest, timeThatRunsBackwardsIsNoTimeAndAPauseAMinuteAtMost) {
    file.messages = {{1h, hex("01")}, {0s, hex("02")}, {1s, hex("03")}, {10h, hex("04")}};
    make().start(sink);
    queue.advance(1ms);
    EXPECT_EQ(sink.messages.size(), 2U);
    queue.advance(1s);
    EXPECT_EQ(sink.messages.size(), 3U);
    queue.advance(59s);
    EXPECT_EQ(sink.messages.size(), 3U);
    queue.advance(2s);
    EXPECT_EQ(sink.messages.size(), 4U);
}

TEST_F(ReplaySourceTest, reportsLossesOnce) {
    file.messages = {{0s, hex("01")}};
    file.losses = {{100, 12, 2, "the block is damaged", false},
                   {200, 7, 4, "the file ends within a block", true}};
    ReplaySource& replay = make();
    for (int round = 0; round < 2; ++round) {
        replay.start(sink);
        queue.advance(1s);
        replay.stop();
    }
    EXPECT_THAT(
        log.textsAt(LogPriority::Warning),
        ElementsAre("drive.pcapng: 12 bytes left out at offset 100 (record 2): the block is damaged",
                    "drive.pcapng: 7 bytes left out at offset 200 (record 4): the file ends within a block"));
}

TEST_F(ReplaySourceTest, reportsTheTotalOfManyLosses) {
    file.messages = {{0s, hex("01")}};
    for (int i = 0; i < 150; ++i)
        file.losses.push_back({0, 2, 1, "damaged", false});
    make().start(sink);
    queue.advance(1s);
    const auto lines = log.textsAt(LogPriority::Warning);
    ASSERT_EQ(lines.size(), MessageReader::maximumLosses + 1);
    EXPECT_EQ(lines.back(), "drive.pcapng: 300 bytes left out in 150 places");
}

TEST_F(ReplaySourceTest, aReadErrorEndsIt) {
    file.messages = {{0s, hex("01")}};
    file.failure = Failure{"cannot be read: Input/output error"};
    make().start(sink);
    queue.advance(1s);
    EXPECT_THAT(log.textsAt(LogPriority::Error),
                ElementsAre("drive.pcapng: cannot be read: Input/output error"));
}

TEST_F(ReplaySourceTest, aRemovedFileIsLogged) {
    file.messages = {{0s, hex("01")}};
    ReplaySource& replay = make();
    unreadable = true;
    replay.start(sink);
    queue.advance(1s);
    EXPECT_TRUE(sink.messages.empty());
    EXPECT_THAT(log.textsAt(LogPriority::Error), ElementsAre("drive.pcapng: is not there"));
    replay.stop();
    unreadable = false;
    replay.start(sink);
    queue.advance(1s);
    EXPECT_EQ(sink.messages.size(), 1U);
}

TEST_F(ReplaySourceTest, refusesAFileWithoutTechnology) {
    file.technology.clear();
    file.messages = {{0s, hex("01")}};
    const auto made =
        ReplaySource::create(queue, clock, "drive.dlf",
                             [this]() -> Result<std::unique_ptr<MessageReader>> {
                                 return std::unique_ptr<MessageReader>(std::make_unique<FakeReader>(file));
                             },
                             {});
    ASSERT_FALSE(made);
    EXPECT_EQ(made.reason(), "drive.dlf: the file does not say which technology its messages are of; "
                             "technology=NAME supplies it");
}

TEST_F(ReplaySourceTest, aNamedTechnologyOverridesTheFile) {
    for (const char* const told : {"", "Ostrel_GSM"}) {
        file.technology = told;
        EXPECT_EQ(make({1, false, "Ostrel_LTE"}).technology(), "kVoxLogChannelTechnology_Ostrel_LTE");
    }
}

TEST_F(ReplaySourceTest, theFactoryRefusesWhatCannotBeRead) {
    const TemporaryDirectory directory;
    const std::string missing = (directory / "missing").string();
    const auto none = makeSource(ReplayChoice{missing, 1, false}, queue, clock);
    ASSERT_FALSE(none);
    EXPECT_THAT(none.reason(), ::testing::StartsWith(missing + ": "));

    const std::string text = (directory / "text").string();
    std::ofstream(text) << "this is no recording";
    const auto rubbish = makeSource(ReplayChoice{text, 1, false}, queue, clock);
    ASSERT_FALSE(rubbish);
    EXPECT_THAT(rubbish.reason(), ::testing::StartsWith(text + ": "));
}

TEST_F(ReplaySourceTest, theFactoryPlaysARecording) {
    const TemporaryDirectory directory;
    const std::string path = (directory / "drive.pcapng").string();
    const auto writer = PcapngWriter::create(path, "Ostrel_LTE");
    ASSERT_TRUE(writer);
    ASSERT_TRUE((*writer)->append(FakeClock::defaultNow(), record(0xB0E5, "01 02").bytes()));
    ASSERT_TRUE((*writer)->append(FakeClock::defaultNow() + 3s, hex("01 02 03").bytes()));
    ASSERT_TRUE((*writer)->close());

    const auto made = makeSource(ReplayChoice{path, 1, false}, queue, clock);
    ASSERT_TRUE(made) << made.reason();
    EXPECT_EQ((*made)->technology(), "kVoxLogChannelTechnology_Ostrel_LTE");
    (*made)->start(sink);
    queue.advance(2900ms);
    EXPECT_THAT(sink.messages, ElementsAre(record(0xB0E5, "01 02")));
    queue.advance(200ms);
    EXPECT_THAT(sink.messages, ElementsAre(record(0xB0E5, "01 02"), hex("01 02 03")));
}

} // namespace
} // namespace velmora
