// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/FrameReader.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <memory>
#include <string>
#include <vector>

namespace velmora {

namespace {

constexpr std::size_t mebibyte = std::size_t{1} << 20;

/// Readers that share ten mebibytes, and how often each had to give up its frame.
class LinuxFrameMemory : public testing::Test {
protected:
    struct Reader {
        explicit Reader(const std::shared_ptr<FrameMemory>& memory) : frames(memory, [this] { ++givenUp; }) {}
        int givenUp = 0;
        FrameReader frames;
    };

    std::unique_ptr<Reader> reader() const { return std::make_unique<Reader>(_memory); }

    /// The header of a frame of 16 MiB and that many bytes of it, in reads as they come from a socket.
    static void begin(Reader& reader, std::size_t bytes) {
        const std::vector<std::uint8_t> piece(FrameReader::maximumRead);
        reader.frames.append(hex("00 00 00 01  00 00 00 00  04 00 00 00  00 00 00 00").bytes());
        for (; bytes > 0; bytes -= std::min(bytes, piece.size()))
            reader.frames.append(Bytes(piece).first(std::min(bytes, piece.size())));
    }

    static bool takesShortFrame(Reader& reader) {
        reader.frames.append(hex("02 00 00 00  05 00 00 00  01 00 00 00  07 01 00 00  68 69").bytes());
        const auto next = reader.frames.next();
        return next && *next && (*next)->payload == hex("68 69");
    }

    std::shared_ptr<FrameMemory> _memory = std::make_shared<FrameMemory>(10 * mebibyte);
};

TEST_F(LinuxFrameMemory, IdleReadersHoldNothing) {
    const auto first = reader();
    EXPECT_EQ(_memory->held(), 0U);
    begin(*first, 100);
    EXPECT_GE(_memory->held(), 116U);
    EXPECT_LE(_memory->held(), 1024U);
}

TEST_F(LinuxFrameMemory, TheReaderThatHoldsTheMostGivesUp) {
    const auto most = reader();
    begin(*most, 3 * mebibyte);
    std::vector<std::unique_ptr<Reader>> others;
    for (int i = 0; i < 20; ++i) {
        others.push_back(reader());
        begin(*others.back(), mebibyte / 4);
        EXPECT_LE(_memory->held(), 10 * mebibyte);
    }
    const auto last = reader();
    begin(*last, 2 * mebibyte);
    EXPECT_LE(_memory->held(), 10 * mebibyte);
    EXPECT_EQ(most->givenUp, 1);
    EXPECT_EQ(most->frames.memory(), 0U);
    for (int again = 0; again < 2; ++again) {
        const auto next = most->frames.next();
        ASSERT_FALSE(next);
        EXPECT_EQ(next.reason(), "unfinished frames take more than 10485760 bytes, and it has the longest");
    }
    most->frames.append(hex("00").bytes());
    EXPECT_EQ(most->frames.memory(), 0U) << "what else it sends is discarded";
    for (const auto& other : others)
        EXPECT_EQ(other->givenUp, 0);
    EXPECT_EQ(last->givenUp, 0);
}

TEST_F(LinuxFrameMemory, AReaderGivesUpItselfWhereItWouldHoldTheMost) {
    const auto first = reader();
    begin(*first, 3 * mebibyte);
    const auto second = reader();
    begin(*second, 9 * mebibyte);
    EXPECT_EQ(first->givenUp, 0);
    EXPECT_EQ(second->givenUp, 1);
    EXPECT_FALSE(second->frames.next());
}

TEST_F(LinuxFrameMemory, AShortFramePassesWhereNothingIsLeft) {
    _memory = std::make_shared<FrameMemory>(1000);
    const auto hoarder = reader();
    std::vector<std::uint8_t> most(996);
    most[3] = 1; // of 16 MiB
    most[8] = 4;
    hoarder->frames.append(most);
    EXPECT_EQ(_memory->held(), 996U);
    const auto modest = reader();
    EXPECT_TRUE(takesShortFrame(*modest));
    EXPECT_EQ(hoarder->givenUp, 1);
    EXPECT_EQ(modest->givenUp, 0);
}

TEST_F(LinuxFrameMemory, MemoryIsFreedWithItsReaderAndItsFrame) {
    auto gone = reader();
    begin(*gone, 4 * mebibyte);
    EXPECT_GE(_memory->held(), 4 * mebibyte);
    gone.reset();
    EXPECT_EQ(_memory->held(), 0U);

    const auto complete = reader();
    Frame frame;
    frame.payload = Data(std::vector<std::uint8_t>(8 * mebibyte));
    complete->frames.append(encodeFrameHeader(frame));
    complete->frames.append(frame.payload.bytes());
    ASSERT_TRUE(complete->frames.next());
    EXPECT_LE(_memory->held(), 4096U);
    EXPECT_TRUE(takesShortFrame(*complete));
}

} // namespace

} // namespace velmora
