// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Observations/RandomMessages.h"
#include "Tests/Playback/PlaybackFixture.h"
#include "Tests/Recording/PcapngFile.h"

#include <random>

namespace velmora {
namespace {

using namespace std::chrono_literals;

constexpr std::size_t driveLength = 3000;
/// Ten checkpoints or more in the drive.
constexpr RecordingIndex::Limits closeCheckpoints{std::size_t{32} << 20, 256};

/// A moment between two messages, in any order of moments: after how many messages.
std::vector<std::size_t> randomMoments(std::size_t messages, std::size_t count) {
    std::mt19937 random(7);
    std::uniform_int_distribution<std::size_t> any(1, messages - 1);
    std::vector<std::size_t> moments;
    while (moments.size() < count)
        moments.push_back(any(random));
    return moments;
}

class TechnologyPlayback : public PlaybackTest, public testing::WithParamInterface<DecodedTechnology> {
protected:
    /// The drive, with messages at times of their own, so that a time names each moment.
    [[nodiscard]] static std::vector<DriveMessage> drive() {
        std::vector<DriveMessage> messages = driveOf(GetParam().scenario, driveLength);
        for (std::size_t i = 1; i < messages.size(); ++i)
            messages[i].time = std::max(messages[i].time, messages[i - 1].time + 1ns);
        return messages;
    }
    /// As a drive, with messages that no modem would send.
    [[nodiscard]] static std::vector<DriveMessage> randomDrive() {
        std::vector<DriveMessage> messages = drive();
        TechnologyUnderTest tested(GetParam());
        std::vector<Data> examples;
        for (std::size_t i = 0; i < 200; ++i)
            examples.push_back(messages[i].message);
        RandomMessages random(tested.decoder(), examples, 3);
        for (DriveMessage& each : messages)
            each.message = random.next();
        return messages;
    }
    void expectSameEverywhere(const std::vector<DriveMessage>& drive) {
        write("drive.pcapng", GetParam().scenario, drive);
        OpenedRecording opened = openAll("drive.pcapng", {}, closeCheckpoints);
        EXPECT_GE(opened.index->checkpoints().size(), driveLength / 256);
        for (const std::size_t moment : randomMoments(drive.size(), 25)) {
            opened.player->seekToTime(drive[moment].time);
            ASSERT_EQ(opened.player->position(), moment);
            ASSERT_EQ(shown(opened), decoded("drive.pcapng", drive[moment].time)) << "at " << moment;
        }
    }
};

TEST_P(TechnologyPlayback, AfterASeekTheDisplayIsThatOfDecodingUpToTheMoment) {
    expectSameEverywhere(drive());
}

TEST_P(TechnologyPlayback, SoItIsOfRandomMessages) {
    expectSameEverywhere(randomDrive());
}

TEST_P(TechnologyPlayback, ASnapshotOfTheMomentIsThatOfConvertingUpToIt) {
    const std::vector<DriveMessage> messages = drive();
    write("drive.pcapng", GetParam().scenario, messages);
    OpenedRecording opened = openAll("drive.pcapng", {}, closeCheckpoints);
    for (const std::size_t moment : randomMoments(messages.size(), 6)) {
        opened.player->seekToTime(messages[moment].time);
        ASSERT_EQ(saved(opened), snapshot("drive.pcapng", messages[moment].time)) << "at " << moment;
    }
    // The first refreshes, of which a snapshot has fewer than it may.
    for (const std::size_t moment : {1U, 10U, 60U}) {
        opened.player->seekToMessage(moment);
        ASSERT_EQ(saved(opened), snapshot("drive.pcapng", messages[moment].time)) << "at " << moment;
    }
}

TEST_P(TechnologyPlayback, SteppingBackShowsWhatSteppingForthHasShown) {
    write("drive.pcapng", GetParam().scenario, drive());
    OpenedRecording opened = openAll("drive.pcapng", {}, closeCheckpoints);
    opened.player->seekToMessage(1000);
    std::vector<std::string> forth;
    for (std::uint64_t i = 0; i < 40; ++i) {
        forth.push_back(shown(opened));
        opened.player->seekToMessage(opened.player->position() + 1);
    }
    while (!forth.empty()) {
        opened.player->seekToMessage(opened.player->position() - 1);
        ASSERT_EQ(shown(opened), forth.back());
        forth.pop_back();
    }
}

INSTANTIATE_TEST_SUITE_P(Technologies, TechnologyPlayback, testing::ValuesIn(decodedTechnologies),
                         [](const auto& decoded) { return std::string(decoded.param.scenario); });

class PlayerTest : public PlaybackTest {
protected:
    /// Messages of a GSM drive at these milliseconds after its start.
    [[nodiscard]] static std::vector<DriveMessage> timed(const std::vector<int>& milliseconds) {
        std::vector<DriveMessage> messages = driveOf("gsm", milliseconds.size());
        for (std::size_t i = 0; i < messages.size(); ++i)
            messages[i].time = FakeClock::defaultNow() + std::chrono::milliseconds(milliseconds[i]);
        return messages;
    }
    static Time after(std::chrono::milliseconds time) { return FakeClock::defaultNow() + time; }
};

TEST_F(PlayerTest, StandsAtTheFrontAtFirst) {
    write("a.pcapng", "gsm", timed({0, 100}));
    OpenedRecording opened = openAll("a.pcapng");
    EXPECT_EQ(opened.player->position(), 0U);
    EXPECT_EQ(opened.player->now(), std::nullopt);
    EXPECT_EQ(opened.player->next(), after(0ms));
    EXPECT_TRUE(opened.player->display().isNone());
}

TEST_F(PlayerTest, DoesNotPassWhatTheIndexHasRead) {
    write("a.pcapng", "gsm", timed({0, 100, 200, 300}));
    OpenedRecording opened = open("a.pcapng");
    opened.index->read(2);
    opened.player->seekToMessage(4);
    EXPECT_EQ(opened.player->position(), 2U);
    EXPECT_EQ(opened.player->next(), std::nullopt);
    EXPECT_EQ(opened.player->failure(), "");
    opened.index->read(10);
    EXPECT_TRUE(opened.index->isComplete());
    opened.player->seekToMessage(4);
    EXPECT_EQ(opened.player->position(), 4U);
}

TEST_F(PlayerTest, StandsBeforeTheFirstMessageAtATimeOrLater) {
    write("a.pcapng", "gsm", timed({0, 100, 100, 300}));
    OpenedRecording opened = openAll("a.pcapng", {}, {std::size_t{1} << 20, 1});
    const std::pair<int, std::uint64_t> moments[] = {{-5, 0}, {0, 0}, {1, 1}, {100, 1}, {101, 3}, {301, 4}};
    for (const auto& [milliseconds, position] : moments) {
        opened.player->seekToTime(after(std::chrono::milliseconds(milliseconds)));
        EXPECT_EQ(opened.player->position(), position) << milliseconds;
    }
}

TEST_F(PlayerTest, CountsTheFilesOrderWhereTimesGoBack) {
    write("a.pcapng", "gsm", timed({0, 500, 200, 300, 600}));
    OpenedRecording opened = openAll("a.pcapng", {}, {std::size_t{1} << 20, 1});
    opened.player->seekToTime(after(250ms));
    EXPECT_EQ(opened.player->position(), 1U);
    opened.player->seekToTime(after(550ms));
    EXPECT_EQ(opened.player->position(), 4U);
}

TEST_F(PlayerTest, PlaysUpToATimeInPieces) {
    write("a.pcapng", "gsm", timed({0, 100, 200, 300, 400}));
    OpenedRecording opened = openAll("a.pcapng");
    EXPECT_FALSE(opened.player->playTo(after(300ms), 2));
    EXPECT_EQ(opened.player->position(), 2U);
    EXPECT_TRUE(opened.player->playTo(after(300ms), 2));
    EXPECT_EQ(opened.player->position(), 4U);
    EXPECT_EQ(opened.player->now(), after(300ms));
    EXPECT_TRUE(opened.player->playTo(after(399ms), 2));
    EXPECT_EQ(opened.player->position(), 4U);
}

// Refreshes lie 2, 4 and 8 s after the first message: where none came between two ticks there is none.
TEST_F(PlayerTest, StepsByRefresh) {
    write("a.pcapng", "gsm", timed({0, 500, 2100, 6500, 6700, 6900}));
    OpenedRecording opened = openAll("a.pcapng", {}, {std::size_t{1} << 20, 2});
    std::vector<std::uint64_t> forth;
    for (int i = 0; i < 4; ++i) {
        opened.player->stepToNextRefresh();
        forth.push_back(opened.player->position());
    }
    EXPECT_EQ(forth, (std::vector<std::uint64_t>{2, 3, 6, 6}));
    std::vector<std::uint64_t> back;
    for (int i = 0; i < 4; ++i) {
        opened.player->stepToEarlierRefresh();
        back.push_back(opened.player->position());
    }
    EXPECT_EQ(back, (std::vector<std::uint64_t>{3, 2, 0, 0}));
    opened.player->seekToMessage(5);
    opened.player->stepToEarlierRefresh();
    EXPECT_EQ(opened.player->position(), 3U);
}

TEST_F(PlayerTest, SaysSoWhereAMessageIsNotThereAnyMore) {
    write("a.pcapng", "gsm", timed({0, 100, 200, 300}));
    OpenedRecording opened = openAll("a.pcapng");
    std::filesystem::resize_file(path("a.pcapng"), 200);
    EXPECT_EQ(opened.file->change(), "has changed");
    OpenedRecording other = open("a.pcapng");
    opened.player->seekToMessage(4);
    EXPECT_LT(opened.player->position(), 4U);
    EXPECT_EQ(opened.player->failure(),
              "message " + std::to_string(opened.player->position() + 1) + " is not there any more");
}

} // namespace
} // namespace velmora
