// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Files/ChunkedInput.h"

#include "Tests/Recording/PcapngFile.h"

#include <algorithm>
#include <memory>
#include <span>
#include <vector>

#include <gtest/gtest.h>

namespace velmora {
namespace {

/// 32-bit little-endian numbers from 0 on, so that every offset can be recognised by its content.
Data counting(std::size_t words) {
    std::vector<std::uint8_t> bytes;
    for (std::size_t i = 0; i < words; ++i) {
        for (unsigned shift = 0; shift < 32; shift += 8)
            bytes.push_back(static_cast<std::uint8_t>(i >> shift));
    }
    return Data(std::move(bytes));
}

constexpr std::size_t smallChunk = 8192;

class ChunkedInputReads : public testing::TestWithParam<std::size_t> {};

TEST_P(ChunkedInputReads, keepPartsValidWhileTheInputAdvances) {
    const Data content = counting(20'000);
    ChunkedInput input(std::make_unique<MemorySource>(content, GetParam()), smallChunk);
    std::vector<Data> parts;
    // 12 bytes do not divide a chunk, so that parts fall across its end.
    while (input.ensure(12)) {
        parts.push_back(input.part(0, 12));
        input.skip(12);
    }
    ASSERT_EQ(parts.size(), 80'000U / 12);
    for (std::size_t i = 0; i < parts.size(); ++i)
        ASSERT_EQ(hexText(parts[i].bytes()), hexText(content.bytes().subspan(12 * i, 12))) << i;
    EXPECT_EQ(input.available().size(), 80'000U % 12);
    EXPECT_EQ(input.offset(), 79'992U);
    EXPECT_FALSE(input.failure());
}

INSTANTIATE_TEST_SUITE_P(Sizes, ChunkedInputReads, testing::Values(1, 5, 4096, SIZE_MAX));

TEST(ChunkedInput, reusesAnUnreferencedChunk) {
    ChunkedInput input(std::make_unique<MemorySource>(counting(20'000)), smallChunk);
    ASSERT_TRUE(input.ensure(4));
    const std::uint8_t* const chunk = input.available().data();
    input.skip(input.available().size());
    ASSERT_TRUE(input.ensure(4));
    EXPECT_EQ(input.available().data(), chunk);
}

TEST(ChunkedInput, alternatesBetweenTwoChunksWhileOnePartIsHeld) {
    ChunkedInput input(std::make_unique<MemorySource>(counting(20'000)), smallChunk);
    std::vector<const std::uint8_t*> chunks;
    Data held;
    for (int i = 0; i < 4; ++i) {
        ASSERT_TRUE(input.ensure(4));
        chunks.push_back(input.available().data());
        held = input.part(0, 4);
        input.skip(input.available().size());
    }
    EXPECT_NE(chunks[0], chunks[1]);
    EXPECT_EQ(chunks[2], chunks[0]);
    EXPECT_EQ(chunks[3], chunks[1]);
}

TEST(ChunkedInput, growsForALongLookAheadAndShrinksAfterIt) {
    const Data content = counting(100'000);
    ChunkedInput input(std::make_unique<MemorySource>(content), smallChunk);
    ASSERT_TRUE(input.ensure(4));
    input.skip(4);
    ASSERT_TRUE(input.ensure(100'000));
    EXPECT_EQ(hexText(input.available().subspan(99'996, 4)), hexText(content.bytes().subspan(100'000, 4)));
    while (input.ensure(4))
        input.skip(input.available().size());
    EXPECT_EQ(input.offset(), 400'000U);
}

TEST(ChunkedInput, reportsAReadErrorWithItsOffset) {
    ChunkedInput input(std::make_unique<MemorySource>(counting(100), SIZE_MAX, 10));
    ASSERT_TRUE(input.ensure(4));
    input.skip(4);
    EXPECT_FALSE(input.ensure(7));
    EXPECT_EQ(input.available().size(), 6U);
    ASSERT_TRUE(input.failure());
    EXPECT_EQ(input.failure()->reason, "cannot read: Input/output error at offset 10");
}

TEST(ChunkedInput, hasPartsThatAreCutToTheirBuffer) {
    const auto buffer = std::make_shared<const std::vector<std::uint8_t>>(std::vector<std::uint8_t>{1, 2, 3});
    EXPECT_EQ(hexText(Data(buffer, 1, 1).bytes()), "02");
    EXPECT_EQ(hexText(Data(buffer, 1, SIZE_MAX).bytes()), "0203");
    EXPECT_TRUE(Data(buffer, 3, 1).empty());
    EXPECT_TRUE(Data(buffer, SIZE_MAX, 1).empty());
    EXPECT_TRUE(Data(nullptr, 0, 1).empty());
}

TEST(ChunkedInput, ofNothingHasNothing) {
    ChunkedInput input(std::make_unique<MemorySource>(Data()));
    EXPECT_TRUE(input.ensure(0));
    EXPECT_FALSE(input.ensure(1));
    EXPECT_TRUE(input.available().empty());
    EXPECT_FALSE(input.failure());
}

/// A memory source that records the largest buffer that it was given.
class WatchedSource final : public ByteSource {
public:
    WatchedSource(Data data, std::size_t& mostRoom) : _memory(std::move(data)), _mostRoom(mostRoom) {}
    Result<std::size_t> read(std::span<std::uint8_t> buffer) override {
        _mostRoom = std::max(_mostRoom, buffer.size());
        return _memory.read(buffer);
    }

private:
    MemorySource _memory;
    std::size_t& _mostRoom;
};

TEST(ChunkedInput, takesNoMemoryForBytesThatAreOnlyPromised) {
    std::size_t mostRoom = 0;
    ChunkedInput input(std::make_unique<WatchedSource>(counting(25), mostRoom), smallChunk);
    EXPECT_FALSE(input.ensure(std::size_t{16} << 20));
    EXPECT_EQ(input.available().size(), 100U);
    // The next power of two above two chunks at most: there are 100 bytes, whatever was asked for.
    EXPECT_LE(mostRoom, 2 * smallChunk);
}

TEST(ChunkedInput, growsToALongLookAheadWithTheBytesThatCome) {
    const Data content = counting(100'000);
    ChunkedInput input(std::make_unique<MemorySource>(content, 5000), smallChunk);
    ASSERT_TRUE(input.ensure(content.size()));
    EXPECT_EQ(Data::copyOf(input.available()), content);
    EXPECT_FALSE(input.ensure(content.size() + 1));
    EXPECT_EQ(Data::copyOf(input.available()), content);
}

} // namespace
} // namespace velmora
