// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/OpenMessages.h"
#include "Recording/Pcapng/PcapngReader.h"
#include "Tests/Recording/PcapngFile.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <cstdint>
#include <filesystem>
#include <fstream>
#include <vector>

#include <gtest/gtest.h>

// Recordings with zeros where blocks should be, as in the hole of a sparse file.

namespace velmora {
namespace {

const Data head = hex("0A0D0D0A 1C000000 4D3C2B1A 0100 0000 FFFFFFFFFFFFFFFF 1C000000"
                      "01000000 20000000 9300 0000 00000000 0200 0300 47534D00 0000 0000 20000000");
const Data packet = hex("06000000 24000000 00000000 00000000 00000000 01000000 01000000 2A000000 24000000");

std::vector<std::uint8_t> recordingWith(std::size_t zeros) {
    std::vector<std::uint8_t> file;
    const auto add = [&file](const Data& data) {
        file.insert(file.end(), data.bytes().begin(), data.bytes().end());
    };
    add(head);
    add(packet);
    file.resize(file.size() + zeros);
    add(packet);
    return file;
}

TEST(HoleTest, BlockAfterAnyNumberOfZeroWordsIsFound) {
    std::vector<std::size_t> lengths = {100'000, 262'144, 1'000'000};
    for (std::size_t words = 1; words < 1100; words += words < 20 || words > 500 ? 1 : 37)
        lengths.push_back(4 * words);
    for (const std::size_t zeros : lengths)
        for (const std::size_t piece : {std::size_t{999}, SIZE_MAX}) {
            const auto reader = PcapngReader::open(
                ChunkedInput(std::make_unique<MemorySource>(Data(recordingWith(zeros)), piece)));
            ASSERT_TRUE(reader);
            ASSERT_TRUE((*reader)->next());
            const auto after = (*reader)->next();
            ASSERT_TRUE(after) << zeros;
            EXPECT_EQ(after->offset, head.size() + packet.size() + zeros);
            EXPECT_FALSE((*reader)->next());
            EXPECT_EQ((*reader)->lossTotals().losses, 1U);
            EXPECT_EQ((*reader)->lossTotals().bytes, zeros);
        }
}

TEST(HoleTest, SectionAfterAnyNumberOfZeroBytesIsFound) {
    for (std::size_t zeros = 1; zeros < 4200; zeros += zeros < 20 || zeros > 4080 ? 1 : 61) {
        std::vector<std::uint8_t> file = recordingWith(zeros);
        file.resize(file.size() - packet.size());
        for (const Data& each : {head, packet})
            file.insert(file.end(), each.bytes().begin(), each.bytes().end());
        const auto reader =
            PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(Data(std::move(file)))));
        ASSERT_TRUE((*reader)->next());
        EXPECT_TRUE((*reader)->next()) << zeros;
        EXPECT_EQ((*reader)->lossTotals().bytes, zeros);
    }
}

TEST(HoleTest, ReadingIsFollowedAndMayBeEnded) {
    const TemporaryDirectory directory;
    const std::string path = directory / "drive.pcapng";
    const std::vector<std::uint8_t> begin = recordingWith(0);
    std::ofstream(path).write(reinterpret_cast<const char*>(begin.data()),
                              static_cast<std::streamsize>(begin.size()));
    std::filesystem::resize_file(path, std::uintmax_t{12} << 30); // which takes no room
    constexpr std::uint64_t far = std::uint64_t{20} << 20;
    std::uint64_t reached = 0;
    FileSource::Hooks hooks;
    hooks.mayRead = [&reached](std::uint64_t offset) {
        EXPECT_LE(offset - reached, std::uint64_t{1} << 20) << "asked often";
        reached = offset;
        return offset < far;
    };
    const auto reader = openMessages(path, hooks);
    ASSERT_TRUE(reader);
    EXPECT_TRUE((*reader)->next());
    EXPECT_TRUE((*reader)->next());
    EXPECT_FALSE((*reader)->next());
    EXPECT_GE(reached, far);
    ASSERT_TRUE((*reader)->failure());
    EXPECT_EQ((*reader)->failure()->reason, "interrupted at offset " + std::to_string(reached));
}

} // namespace
} // namespace velmora
