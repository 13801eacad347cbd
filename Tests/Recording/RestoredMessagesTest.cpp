// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/DLF/RestoredMessages.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <cstdint>
#include <vector>

namespace velmora {
namespace {

using Buffer = std::vector<std::uint8_t>;

Buffer copied(const Data& data) {
    return {data.bytes().begin(), data.bytes().end()};
}

TEST(RestoredMessagesTest, MessageIsItsFirstByteAndTheOthers) {
    RestoredMessages messages;
    const Data message = messages.add(0x10, Buffer{1, 2, 3});
    const Data alone = messages.add(0xFF, Bytes());
    EXPECT_EQ(copied(message), (Buffer{0x10, 1, 2, 3}));
    EXPECT_EQ(copied(alone), (Buffer{0xFF}));
}

TEST(RestoredMessagesTest, KeptMessagesStayAsTheyAre) {
    RestoredMessages messages;
    std::vector<Data> kept;
    // Four chunks of messages, of which each tenth is kept.
    constexpr std::size_t size = 1000;
    for (int i = 0; i < 4 * 65; ++i) {
        const Data message = messages.add(static_cast<std::uint8_t>(i), Buffer(size, 7));
        if (i % 10 == 0)
            kept.push_back(message);
    }
    for (std::size_t i = 0; i < kept.size(); ++i) {
        Buffer wanted(size + 1, 7);
        wanted[0] = static_cast<std::uint8_t>(10 * i);
        EXPECT_EQ(copied(kept[i]), wanted) << i;
    }
}

TEST(RestoredMessagesTest, ChunkWithoutMessagesIsUsedAgain) {
    RestoredMessages messages;
    const Buffer half(RestoredMessages::chunkSize / 2, 1);
    const std::uint8_t* const first = messages.add(0, half).bytes().data();
    EXPECT_EQ(messages.add(0, half).bytes().data(), first);
}

TEST(RestoredMessagesTest, MessageMayBeLongerThanAChunk) {
    RestoredMessages messages;
    static_cast<void>(messages.add(1, Buffer{2}));
    const Buffer rest(2 * RestoredMessages::chunkSize, 5);
    const Data message = messages.add(4, rest);
    EXPECT_EQ(message.size(), rest.size() + 1);
    EXPECT_EQ(message.bytes()[0], 4);
    EXPECT_EQ(copied(message.from(1)), rest);
}

} // namespace
} // namespace velmora
