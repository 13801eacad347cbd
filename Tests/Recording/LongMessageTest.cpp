// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/MessageReader.h"
#include "Recording/Pcapng/PcapngReader.h"
#include "Recording/Pcapng/PcapngWriter.h"
#include "Recording/Pcapng/RecordingCopy.h"
#include "Tests/Recording/FakeRecordingFile.h"
#include "Tests/Recording/PcapngFile.h"
#include "Tests/Support/ShellCommand.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <algorithm>
#include <chrono>
#include <filesystem>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

// Messages that are longer than a packet that capture tools read.

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

constexpr std::size_t part = 262'144;
constexpr std::size_t headSize = 100;      // of a technology's name of 9 to 12 bytes
constexpr std::size_t packetOverhead = 32; // type, two lengths, interface, time, two sizes
constexpr std::size_t partOverhead = 16;   // type, two lengths, offset

/// Bytes that differ from part to part.
Data messageOf(std::size_t size) {
    std::vector<std::uint8_t> bytes(size);
    for (std::size_t at = 0; at < size; ++at)
        bytes[at] = static_cast<std::uint8_t>(at ^ at >> 8 ^ at >> 16);
    return Data(std::move(bytes));
}

class LongMessageTest : public testing::Test {
protected:
    void write(const std::vector<Data>& messages) const {
        auto writer = PcapngWriter::create(_path, "Ostrel_GSM");
        ASSERT_TRUE(writer);
        for (const Data& message : messages)
            ASSERT_TRUE((*writer)->append(Time(std::chrono::seconds(1)), message.bytes()));
        ASSERT_TRUE((*writer)->close());
    }
    /// The sizes of the messages; each must be as `messageOf` makes it.
    [[nodiscard]] static std::vector<std::size_t> sizesIn(const std::string& path, std::uint64_t losses = 0) {
        const auto reader = PcapngReader::open(path);
        EXPECT_TRUE(reader) << reader.reason();
        std::vector<std::size_t> sizes;
        while (const auto message = (*reader)->next()) {
            EXPECT_TRUE(message->message == messageOf(message->message.size()));
            sizes.push_back(message->message.size());
        }
        EXPECT_EQ((*reader)->lossTotals().losses, losses);
        return sizes;
    }

    TemporaryDirectory _directory;
    const std::string _path = _directory / "long.pcapng";
};

TEST_F(LongMessageTest, HasItsPartsInSeveralBlocks) {
    write({messageOf(part), messageOf(part + 1), messageOf(3 * part), messageOf(5)});
    EXPECT_THAT(sizesIn(_path), ElementsAre(part, part + 1, 3 * part, 5U));
    EXPECT_EQ(std::filesystem::file_size(_path),
              headSize + 4 * packetOverhead + 3 * partOverhead + 5 * part + 4 + 8);
}

TEST_F(LongMessageTest, LongestOneIsReadBack) {
    write({messageOf(maximumMessageSize), messageOf(1)});
    EXPECT_THAT(sizesIn(_path), ElementsAre(maximumMessageSize, 1U));
}

TEST_F(LongMessageTest, CaptureToolsReadOn) {
    NEEDS_PROGRAM("tshark");
    write({messageOf(20), messageOf(1'000'000), messageOf(30)});
    const ShellOutcome listed =
        runShell("tshark -r " + _path + " -T fields -e frame.len -e frame.cap_len 2> /dev/null");
    EXPECT_EQ(listed.status, 0);
    EXPECT_EQ(listed.output, "20\t20\n1000000\t262144\n30\t30\n");
    const ShellOutcome counted = runShell("capinfos -c " + _path);
    EXPECT_EQ(counted.status, 0);
    EXPECT_THAT(counted.output, HasSubstr("Number of packets:   3"));
}

TEST_F(LongMessageTest, WithoutItsOtherPartsIsALoss) {
    NEEDS_PROGRAM("editcap");
    write({messageOf(20), messageOf(300'000), messageOf(30)});
    const std::string cut = _directory / "cut.pcapng"; // which has no blocks that the tool does not know
    ASSERT_EQ(runShell("editcap " + _path + " " + cut).status, 0);
    EXPECT_THAT(sizesIn(cut, 1), ElementsAre(20U, 30U));
    const auto reader = PcapngReader::open(cut);
    while ((*reader)->next()) {
    }
    EXPECT_EQ((*reader)->losses().front().recordNumber, 2U);
    EXPECT_EQ((*reader)->losses().front().reason,
              "message cut short when it was captured: 262144 of 300000 bytes");
}

TEST_F(LongMessageTest, TruncatedInTheSecondPartIsALoss) {
    write({messageOf(20), messageOf(300'000)});
    std::filesystem::resize_file(_path, std::filesystem::file_size(_path) - 100);
    EXPECT_THAT(sizesIn(_path, 2), ElementsAre(20U)); // the packet, and the block that is cut off
}

TEST_F(LongMessageTest, CopyHasAllPartsAndSplitsWhatIsInOne) {
    write({messageOf(300'000)});
    // As a packet of an earlier version, whose block holds all of it, with a comment.
    std::vector<std::uint8_t> file;
    const Data head = hex("0A0D0D0A 1C000000 4D3C2B1A 0100 0000 FFFFFFFFFFFFFFFF 1C000000"
                          "01000000 20000000 9300 0000 00000000 0200 0300 47534D00 0000 0000 20000000");
    const Data message = messageOf(300'002);
    const Data packetHead = hex("06000000 10940400 00000000 00000000 00000000 E2930400 E2930400");
    const Data packetEnd = hex("0000 0100 0400 6E6F7465 0000 0000 10940400");
    for (const Data& each : {head, packetHead, message, packetEnd})
        file.insert(file.end(), each.bytes().begin(), each.bytes().end());
    const auto reader = PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(Data::copyOf(file))));
    ASSERT_TRUE(reader);
    FakeOutputFile medium;
    RecordingCopy copy(**reader, std::make_unique<FakeRecordingFile>(medium), "copy", {});
    while ((*reader)->next())
        ASSERT_TRUE(copy.addMessage());
    ASSERT_TRUE(copy.finish());
    const auto copied =
        PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(Data::copyOf(medium.content))));
    const auto read = (*copied)->next();
    ASSERT_TRUE(read);
    EXPECT_TRUE(read->message == message);
    EXPECT_FALSE((*copied)->next());
    ASSERT_EQ((*copied)->comments().first().size(), 1U);
    EXPECT_EQ((*copied)->comments().first()[0].text, "note");
    EXPECT_EQ(medium.content.size(), file.size() + partOverhead);
}

} // namespace
} // namespace velmora
