// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogMessage.h"
#include "LogMessages/RecordTime.h"
#include "Recording/Pcapng/PcapngWriter.h"
#include "Tests/Support/NMEA.h"
#include "Tests/Tools/Mask/MaskFixture.h"

#include <gmock/gmock.h>

#include <fstream>

#include <zlib.h>

namespace velmora {
namespace {

using testing::HasSubstr;
using testing::Not;

class MaskFormsTest : public MaskTest {
protected:
    [[nodiscard]] static Data stamped(const Data& message, Time time) {
        std::vector<std::uint8_t> bytes(message.bytes().begin(), message.bytes().end());
        for (std::size_t i = 0; i < 8; ++i)
            bytes[LogMessage::timestampOffset + i] =
                static_cast<std::uint8_t>(recordTimestamp(time) >> (8 * i));
        return Data(std::move(bytes));
    }
    void writePositions(const std::string& name, const std::vector<std::string>& sentences);
    void convert(const std::string& in, const std::string& out) {
        ToolProcess process(tool({"convert", path(in), path(out)}));
        EXPECT_EQ(process.exitStatus(), 0) << process.errors();
    }
};

TEST_F(MaskFormsTest, SnapshotIsMadeOfMaskedMessages) {
    convert("drive.pcapng", "drive.velmora");
    ASSERT_THAT(contentOf("drive.velmora"), HasSubstr(iccid));
    static_cast<void>(mask({"--key", path("key"), path("drive.velmora"), path("out/a.velmora")}));
    EXPECT_EQ(cardIn("out/a.velmora"), _masked);
    EXPECT_THAT(contentOf("out/a.velmora"), Not(HasSubstr(iccid)));
    static_cast<void>(mask({"--check", path("out/a.velmora")}));
    static_cast<void>(mask({"--key", path("key"), path("out/a.velmora"), path("out/b.velmora")}));
    EXPECT_EQ(contentOf("out/a.velmora"), contentOf("out/b.velmora"));
}

TEST_F(MaskFormsTest, ChangedSnapshotIsNotSealedAnyMore) {
    static_cast<void>(mask({path("drive.pcapng"), path("out/a.velmora")}));
    std::string content = contentOf("out/a.velmora");
    const std::size_t display = content.find("RR_IDLE");
    ASSERT_NE(display, std::string::npos);
    content.replace(display, 7, "SECRET!");
    std::ofstream(path("changed.velmora"), std::ios::binary) << content;
    EXPECT_THAT(mask({"--check", path("changed.velmora")}, 1).output, HasSubstr("in clear: "));
}

TEST_F(MaskFormsTest, LogIsMaskedAndSealed) {
    convert("drive.pcapng", "drive.dlf");
    static_cast<void>(
        mask({"--key", path("key"), "--technology", "GSM", path("drive.dlf"), path("out/a.dlf")}));
    EXPECT_EQ(cardIn("out/a.dlf"), _masked);
    static_cast<void>(mask({"--check", "--technology", "GSM", path("out/a.dlf")}));
    static_cast<void>(
        mask({"--key", path("key"), "--technology", "GSM", path("out/a.dlf"), path("out/b.dlf")}));
    EXPECT_EQ(contentOf("out/a.dlf"), contentOf("out/b.dlf"));
    std::string content = contentOf("out/a.dlf");
    content.back() = static_cast<char>(content.back() ^ 1);
    std::ofstream(path("changed.dlf"), std::ios::binary) << content;
    static_cast<void>(mask({"--check", "--technology", "GSM", path("changed.dlf")}, 1));
}

TEST_F(MaskFormsTest, LogHasNoRecordThatItsReaderWouldNotFind) {
    std::vector<TimedMessage> drive = {{at(0), rrState(4)}, {at(500), rrState(5)}, {at(4100), rrState(4)}};
    for (TimedMessage& each : drive)
        each.message = stamped(each.message, each.time);
    // Of an unknown code and without a time: masked, it is zeros but for its length and code.
    drive.insert(drive.begin() + 2, {at(1000), record(0x1375, "38 39 30 30 30 30 30 31 32 33")});
    drive.insert(drive.begin() + 3, {at(2000), stamped(record(0x1375, "38 39 30 30"), at(2000))});
    writeRecording("zeros.pcapng", "Ostrel_GSM", drive);
    static_cast<void>(mask({path("zeros.pcapng"), path("out/a.pcapng")}));
    EXPECT_EQ(messagesOf("out/a.pcapng").size(), 5U);
    const Outcome outcome = mask({"--report", path("zeros.pcapng"), path("out/a.dlf")});
    EXPECT_THAT(outcome.output + outcome.messages, HasSubstr("5 messages, 2 changed, 1 left out"));
    EXPECT_EQ(messagesOf("out/a.dlf").size(), 4U);
    static_cast<void>(mask({"--check", "--technology", "GSM", path("out/a.dlf")}));
}

/// Writes the drive with these sentences after the first message.
void MaskFormsTest::writePositions(const std::string& name, const std::vector<std::string>& sentences) {
    const auto writer = PcapngWriter::create(path(name), "Ostrel_GSM", PcapngWriter::Positions::With);
    ASSERT_TRUE(writer) << writer.reason();
    for (const TimedMessage& each : _drive) {
        ASSERT_TRUE((*writer)->append(each.time, each.message.bytes()));
        if (each.time != _drive.front().time)
            continue;
        for (const std::string& sentence : sentences)
            ASSERT_TRUE((*writer)->appendSentence(each.time, nmea0183(sentence)));
    }
    ASSERT_TRUE((*writer)->close());
}

TEST_F(MaskFormsTest, SealCoversPositions) {
    const std::string sentence = "GPGLL,5920.0000,N,01803.0000,E,050000,A,A";
    writePositions("placed.pcapng", {sentence});
    static_cast<void>(mask({"--key", path("key"), path("placed.pcapng"), path("out/a.pcapng")}));
    static_cast<void>(mask({"--check", path("out/a.pcapng")}));
    static_cast<void>(mask({"--key", path("key"), path("out/a.pcapng"), path("out/b.pcapng")}));
    EXPECT_EQ(contentOf("out/a.pcapng"), contentOf("out/b.pcapng"));
    std::string content = contentOf("out/a.pcapng");
    const std::size_t place = content.find("5920.0000");
    ASSERT_NE(place, std::string::npos);
    content.replace(place, 9, "5921.0000");
    std::ofstream(path("changed.pcapng"), std::ios::binary) << content;
    EXPECT_THAT(mask({"--check", path("changed.pcapng")}, 1).output, HasSubstr("in clear: subscriber 1"));
}

TEST_F(MaskFormsTest, PositionAddedLaterIsNoticed) {
    static_cast<void>(mask({"--key", path("key"), path("drive.pcapng"), path("out/a.pcapng")}));
    std::ofstream(path("track.nmea")) << nmea0183("GPRMC,050001,A,5920.0000,N,01803.0000,E,,,161126,,");
    ToolProcess process(
        tool({"convert", "--track", path("track.nmea"), path("out/a.pcapng"), path("added.pcapng")}));
    ASSERT_EQ(process.exitStatus(), 0) << process.errors();
    EXPECT_THAT(mask({"--check", path("added.pcapng")}, 1).output, HasSubstr("in clear: subscriber 1"));
}

TEST_F(MaskFormsTest, SealOfAnEarlierVersionIsRead) {
    static_cast<void>(mask({path("drive.pcapng"), path("out/a.pcapng")}));
    // A comment of a block of statistics, without the digest of positions and with its lengths.
    std::string content = contentOf("out/a.pcapng");
    constexpr std::string_view mark = " positions=";
    const std::size_t digest = content.find(mark);
    ASSERT_NE(digest, std::string::npos);
    const std::size_t begin = content.rfind("velmora-mask 1", digest);
    const auto length = static_cast<std::uint16_t>(digest - begin);
    std::string old = content.substr(begin, length);
    old.resize((old.size() + 3) / 4 * 4);
    constexpr std::size_t before = 20 + 4; // the block's fields, the option's code and length
    std::string block = content.substr(begin - before, before) + old + std::string(8, '\0');
    const auto put = [&block](std::size_t offset, std::size_t value, std::size_t width) {
        for (std::size_t i = 0; i < width; ++i)
            block[offset + i] = static_cast<char>(value >> (8 * i));
    };
    put(22, length, 2);
    put(4, block.size(), 4);
    put(block.size() - 4, block.size(), 4);
    std::ofstream(path("old.pcapng"), std::ios::binary) << content.substr(0, begin - before) << block;
    static_cast<void>(mask({"--check", path("old.pcapng")}));
}

TEST_F(MaskFormsTest, PositionsThatALevelRemovesAreInClear) {
    // The second one is a maker's own.
    writePositions("placed.pcapng", {"GPGLL,5920.0000,N,01803.0000,E,050000,A,A", "PXYZ,12345"});
    EXPECT_THAT(mask({"--check", path("placed.pcapng")}, 1).output, HasSubstr("in clear: position 1\n"));
    static_cast<void>(mask({path("placed.pcapng"), path("out/a.pcapng")}));
    static_cast<void>(mask({"--check", path("out/a.pcapng")}));
    EXPECT_THAT(mask({"--check", "--level", "all", path("out/a.pcapng")}, 1).output,
                HasSubstr("in clear: position 1\n"));
    static_cast<void>(mask({"--level", "all", path("placed.pcapng"), path("out/b.pcapng")}));
    static_cast<void>(mask({"--check", "--level", "all", path("out/b.pcapng")}));
}

TEST_F(MaskFormsTest, GzippedFilesAreRead) {
    const std::string content = contentOf("drive.pcapng");
    gzFile packed = gzopen(path("drive.pcapng.gz").c_str(), "wb");
    ASSERT_NE(packed, nullptr);
    EXPECT_EQ(gzwrite(packed, content.data(), static_cast<unsigned>(content.size())),
              static_cast<int>(content.size()));
    EXPECT_EQ(gzclose(packed), Z_OK);
    std::ofstream(path("known")) << iccid << "\n";
    EXPECT_THAT(mask({"--check", path("drive.pcapng.gz"), "--known", path("known")}, 1).output,
                HasSubstr("found: text"));
    static_cast<void>(mask({"--key", path("key"), path("drive.pcapng.gz"), path("out/a.pcapng")}));
    EXPECT_EQ(cardIn("out/a.pcapng"), _masked);
}

TEST_F(MaskFormsTest, StandardInputIsMasked) {
    static_cast<void>(mask({"--key", path("key"), "-", path("out/a.pcapng")}, 0, contentOf("drive.pcapng")));
    EXPECT_EQ(cardIn("out/a.pcapng"), _masked);
}

TEST_F(MaskFormsTest, TimesMoveAtTheLastLevel) {
    static_cast<void>(mask({"--level", "all", path("drive.pcapng"), path("out/a.pcapng")}));
    const std::vector<LoggedMessage> messages = messagesOf("out/a.pcapng");
    ASSERT_EQ(messages.size(), 4U);
    const Time epoch = std::chrono::sys_days(std::chrono::year(2000) / 1 / 1);
    EXPECT_EQ(messages[0].time, epoch);
    EXPECT_EQ(messages[3].time, epoch + std::chrono::milliseconds(4100));
}

TEST_F(MaskFormsTest, TechnologyThatNoFileNamesIsAsked) {
    writeRecording("unnamed.pcapng", "", _drive);
    EXPECT_THAT(mask({path("unnamed.pcapng"), path("out/a.pcapng")}, 1).messages,
                HasSubstr("--technology supplies it"));
    static_cast<void>(
        mask({"--key", path("key"), "--technology", "GSM", path("unnamed.pcapng"), path("out/a.pcapng")}));
    EXPECT_EQ(cardIn("out/a.pcapng"), _masked);
}

} // namespace
} // namespace velmora
