// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/TelephonyService.h"
#include "Tests/Playback/PlaybackFixture.h"
#include "Tests/Recording/PcapngFile.h"

#include <stdexcept>

namespace velmora {
namespace {

using namespace std::chrono_literals;

class RecordingIndexTest : public PlaybackTest {
protected:
    static std::uint64_t stamp(std::int64_t milliseconds) {
        const Time time = FakeClock::defaultNow() + std::chrono::milliseconds(milliseconds);
        return static_cast<std::uint64_t>(time.time_since_epoch().count());
    }
    [[nodiscard]] std::string reasonOf(const std::string& name, const std::string& technology = {}) const {
        try {
            static_cast<void>(openAll(name, technology));
            return "opened";
        } catch (const std::runtime_error& failure) {
            return failure.what();
        }
    }
    /// Two messages of a GSM phone and three of an LTE phone.
    [[nodiscard]] static PcapngFile bothPhones() {
        PcapngFile file;
        const auto gsm = driveOf("gsm", 2);
        const auto lte = driveOf("lte", 3);
        file.section().messageInterface("Ostrel_GSM").messageInterface("Ostrel_LTE");
        file.message(stamp(0), gsm[0].message.bytes(), 0);
        file.message(stamp(500), lte[0].message.bytes(), 1);
        file.message(stamp(600), lte[1].message.bytes(), 1);
        file.message(stamp(700), gsm[1].message.bytes(), 0);
        file.message(stamp(800), lte[2].message.bytes(), 1);
        return file;
    }
};

TEST_F(RecordingIndexTest, CountsTheFilesMessagesAndTimes) {
    const auto drive = driveOf("lte", 700);
    write("a.pcapng", "lte", drive);
    const OpenedRecording opened = openAll("a.pcapng");
    EXPECT_EQ(opened.index->messages(), 700U);
    EXPECT_EQ(opened.index->technology(), "Ostrel_LTE");
    EXPECT_EQ(opened.index->first(), drive.front().time);
    EXPECT_EQ(opened.index->last(), drive.back().time);
    EXPECT_DOUBLE_EQ(opened.file->progress(), 1);
}

// 4000 messages with a checkpoint after each 16 would have 250 of them; an LTE display takes some 30 KiB.
TEST_F(RecordingIndexTest, ThinsCheckpointsOutWhereTheirMemoryWouldPassTheLimit) {
    const auto drive = driveOf("lte", 4000);
    write("a.pcapng", "lte", drive);
    constexpr std::size_t limit = std::size_t{1} << 20;
    OpenedRecording opened = openAll("a.pcapng", {}, {limit, 16});
    EXPECT_LE(opened.index->memory(), limit);
    const auto& checkpoints = opened.index->checkpoints();
    EXPECT_GT(checkpoints.size(), 5U);
    EXPECT_LT(checkpoints.size(), 200U);
    EXPECT_EQ(checkpoints.front().messages(), 0U);
    for (std::size_t i = 1; i < checkpoints.size(); ++i)
        EXPECT_GT(checkpoints[i].messages(), checkpoints[i - 1].messages());
    for (const std::size_t moment : {3999U, 1U, 2500U, 777U}) {
        opened.player->seekToMessage(moment);
        EXPECT_EQ(shown(opened), decoded("a.pcapng", drive[moment].time)) << moment;
    }
}

TEST_F(RecordingIndexTest, ReadsEachTechnologyOfAFileAsAStreamOfItsOwn) {
    writeBytes("both.pcapng", bothPhones().data());
    OpenedRecording gsm = openAll("both.pcapng");
    EXPECT_EQ(gsm.index->technology(), "Ostrel_GSM");
    EXPECT_EQ(gsm.index->messages(), 2U);
    OpenedRecording lte = openAll("both.pcapng", "Ostrel_LTE", {std::size_t{1} << 20, 1});
    EXPECT_EQ(lte.index->messages(), 3U);
    lte.player->seekToMessage(3);
    EXPECT_EQ(shown(lte), decoded("both.pcapng", {}, "Ostrel_LTE"));
    lte.player->seekToMessage(1);
    lte.player->seekToMessage(2);
    EXPECT_EQ(lte.player->now(), FakeClock::defaultNow() + 600ms);
    EXPECT_EQ(reasonOf("both.pcapng", "IFX"),
              "holds Ostrel_GSM and Ostrel_LTE, wanted one of these and not IFX");
}

TEST_F(RecordingIndexTest, ContinuesInASecondSectionOfTheOtherByteOrder) {
    PcapngFile file;
    const auto drive = driveOf("gsm", 4);
    file.section().messageInterface("Ostrel_GSM");
    file.message(stamp(0), drive[0].message.bytes());
    PcapngFile second(true);
    second.section().messageInterface("other").messageInterface("Ostrel_GSM");
    for (int i = 1; i < 4; ++i)
        second.message(stamp(i * 100), drive[static_cast<std::size_t>(i)].message.bytes(), 1);
    file.raw(second.data().bytes());
    writeBytes("a.pcapng", file.data());
    OpenedRecording opened = openAll("a.pcapng", "Ostrel_GSM", {std::size_t{1} << 20, 1});
    ASSERT_EQ(opened.index->messages(), 4U);
    for (const std::uint64_t moment : {4U, 3U, 2U, 1U}) {
        opened.player->seekToMessage(0);
        opened.player->seekToMessage(moment);
        EXPECT_EQ(opened.player->now(), FakeClock::defaultNow() + 100ms * (moment - 1));
        EXPECT_EQ(opened.player->failure(), "");
    }
}

TEST_F(RecordingIndexTest, ReportsDamageAndShowsWhatCouldBeRead) {
    PcapngFile file;
    const auto drive = driveOf("gsm", 3);
    file.head();
    file.message(stamp(0), drive[0].message.bytes());
    const std::size_t damaged = file.size();
    file.message(stamp(100), drive[1].message.bytes());
    file.bytes()[damaged + 4] ^= 0xFF; // its length
    const std::size_t after = file.size();
    file.message(stamp(200), drive[2].message.bytes());
    writeBytes("a.pcapng", file.data());
    OpenedRecording opened = openAll("a.pcapng", {}, {std::size_t{1} << 20, 1});
    EXPECT_EQ(opened.index->messages(), 2U);
    ASSERT_EQ(opened.file->reader().losses().size(), 1U);
    EXPECT_EQ(opened.file->reader().losses().front().offset, damaged);
    EXPECT_EQ(opened.file->reader().losses().front().bytes, after - damaged);
    opened.player->seekToMessage(2);
    EXPECT_EQ(shown(opened), decoded("a.pcapng", {}));
}

TEST_F(RecordingIndexTest, CountsWhatCannotBeDecoded) {
    PcapngFile file;
    file.section().messageInterface("IFX");
    const auto drive = driveOf("ifx", 2);
    file.message(stamp(0), drive[0].message.bytes());
    const std::uint8_t junk[] = {0x00, 0x01, 0x02, 0x03};
    const std::size_t offset = file.size();
    file.message(stamp(100), Bytes(junk));
    file.message(stamp(200), drive[1].message.bytes());
    writeBytes("a.pcapng", file.data());
    OpenedRecording opened = openAll("a.pcapng");
    EXPECT_EQ(opened.index->messages(), 3U);
    EXPECT_EQ(opened.index->undecoded().messages, 1U);
    EXPECT_EQ(opened.index->undecoded().number, 2U);
    EXPECT_EQ(opened.index->undecoded().offset, offset);
    opened.player->seekToMessage(3);
    EXPECT_EQ(shown(opened), decoded("a.pcapng", {}));
}

TEST_F(RecordingIndexTest, RefusesWhatIsNoFileOfMessages) {
    EXPECT_EQ(reasonOf("missing.pcapng"), "cannot open: No such file or directory");
    EXPECT_EQ(reasonOf("."), "got a directory, wanted a regular file");
    write("a.pcapng", "gsm", driveOf("gsm", 1));
    EXPECT_EQ(reasonOf("a.pcapng", "Ostrel_XYZ"),
              "technology \"Ostrel_XYZ\" is unknown, wanted one of " + technologyNames());
}

} // namespace
} // namespace velmora
