// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recording/PcapngWriterFixture.h"

#include <cerrno>
#include <string>
#include <vector>

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;

using PcapngWriterErrorTest = PcapngWriterFixture;

TEST_F(PcapngWriterErrorTest, FullDiskKeepsCompleteBlocksAndContinuesWithoutAGap) {
    start();
    ASSERT_TRUE(append(1));
    ASSERT_TRUE(writer->flush());
    // Room for the second message and a part of the third.
    medium.room = headSize + 2 * blockSize + 20;
    ASSERT_TRUE(append(2));
    ASSERT_TRUE(append(3));
    EXPECT_FALSE(writer->hasTemporaryError());
    EXPECT_EQ(reasonOf(writer->flush()), full);
    EXPECT_TRUE(writer->hasTemporaryError());
    EXPECT_FALSE(writer->isDropping());
    EXPECT_EQ(medium.content.size(), headSize + 2 * blockSize) << "the part of a block is taken back";
    EXPECT_THAT(numbers(), ElementsAre(1, 2));
    EXPECT_EQ(writer->unsaved().messages, 1U);

    // Meanwhile messages are kept, and every call says why they are not in the file.
    EXPECT_EQ(reasonOf(append(4)), full);
    EXPECT_EQ(reasonOf(writer->flush()), full);
    EXPECT_EQ(writer->messages(), 4U);
    EXPECT_EQ(writer->unsaved().messages, 2U);
    EXPECT_THAT(numbers(), ElementsAre(1, 2));

    medium.room = SIZE_MAX;
    EXPECT_EQ(reasonOf(append(5)), full) << "only a flush tries again";
    ASSERT_TRUE(writer->flush());
    EXPECT_FALSE(writer->hasTemporaryError());
    EXPECT_EQ(writer->unsaved().messages, 0U);
    EXPECT_EQ(writer->droppedMessages(), 0U);
    ASSERT_TRUE(append(6));
    ASSERT_TRUE(writer->close());
    EXPECT_TRUE(medium.closed);
    EXPECT_THAT(numbers(), ElementsAre(1, 2, 3, 4, 5, 6));
}

TEST_F(PcapngWriterErrorTest, AnyDiskSpaceLeavesCompleteBlocks) {
    for (std::size_t room = 0; room <= headSize + 3 * blockSize; ++room) {
        medium = FakeOutputFile();
        medium.room = room;
        start();
        for (std::uint8_t number = 1; number <= 3; ++number)
            static_cast<void>(append(number));
        static_cast<void>(writer->flush());
        const std::size_t blocks = room < headSize ? 0 : (room - headSize) / blockSize;
        // The head is two blocks, of 52 and 48 bytes.
        ASSERT_EQ(medium.content.size(), room < 52         ? 0
                                         : room < headSize ? 52
                                                           : headSize + blocks * blockSize)
            << room;
        ASSERT_EQ(writer->hasTemporaryError(), blocks < 3) << room;
        medium.room = SIZE_MAX;
        ASSERT_TRUE(writer->close()) << room;
        ASSERT_THAT(numbers(), ElementsAre(1, 2, 3)) << room;
    }
}

TEST_F(PcapngWriterErrorTest, TemporaryErrors) {
    for (const int error : {ENOSPC, EDQUOT, EFBIG, EIO, EROFS}) {
        medium = FakeOutputFile();
        start();
        medium.room = 0;
        medium.fullError = error;
        ASSERT_TRUE(append(1));
        EXPECT_FALSE(writer->flush()) << error;
        EXPECT_TRUE(writer->hasTemporaryError()) << error;
    }
}

TEST_F(PcapngWriterErrorTest, OtherErrorsArePermanent) {
    start();
    ASSERT_TRUE(append(1));
    medium.room = 0;
    medium.fullError = EBADF;
    const std::string reason = "cannot write the recording: Bad file descriptor";
    EXPECT_EQ(reasonOf(writer->flush()), reason);
    EXPECT_FALSE(writer->hasTemporaryError());
    medium.room = SIZE_MAX;
    EXPECT_EQ(reasonOf(append(2)), reason);
    EXPECT_EQ(reasonOf(writer->flush()), reason);
    EXPECT_EQ(reasonOf(writer->sync()), reason);
    EXPECT_EQ(reasonOf(writer->close()), reason);
    EXPECT_EQ(writer->unsaved().messages, 1U);
    EXPECT_THAT(numbers(), ElementsAre());
}

TEST_F(PcapngWriterErrorTest, UntruncatableOutputFailsPermanently) {
    medium.isRegular = false;
    start();
    ASSERT_TRUE(append(1));
    medium.room = headSize + 5;
    EXPECT_EQ(reasonOf(writer->flush()), full);
    EXPECT_FALSE(writer->hasTemporaryError());
    EXPECT_EQ(medium.content.size(), headSize + 5);
    medium.room = SIZE_MAX;
    EXPECT_EQ(reasonOf(writer->flush()), full);
    EXPECT_EQ(medium.content.size(), headSize + 5);
}

TEST_F(PcapngWriterErrorTest, NothingIsWrittenAfterAPartialBlockThatCannotBeTruncatedYet) {
    start();
    ASSERT_TRUE(append(1));
    medium.room = headSize + 5;
    medium.cutError = EIO;
    EXPECT_EQ(reasonOf(writer->flush()), full);
    EXPECT_TRUE(writer->hasTemporaryError());
    medium.room = SIZE_MAX;
    EXPECT_EQ(reasonOf(writer->flush()), broken);
    EXPECT_EQ(medium.content.size(), headSize + 5);
    medium.cutError = 0;
    ASSERT_TRUE(writer->close());
    EXPECT_THAT(numbers(), ElementsAre(1));
}

TEST_F(PcapngWriterErrorTest, HeaderMayBeQueuedToo) {
    medium.room = 60;
    start();
    EXPECT_TRUE(writer->hasTemporaryError());
    EXPECT_EQ(reasonOf(append(1)), full);
    EXPECT_EQ(writer->unsaved().messages, 1U);
    medium.room = SIZE_MAX;
    ASSERT_TRUE(writer->close());
    EXPECT_THAT(numbers(), ElementsAre(1));
}

TEST_F(PcapngWriterErrorTest, UnsavedMessagesAreCountedAtTheEnd) {
    start();
    medium.room = headSize;
    ASSERT_TRUE(append(1));
    ASSERT_TRUE(append(2));
    EXPECT_EQ(reasonOf(writer->close()), full);
    EXPECT_TRUE(medium.closed);
    EXPECT_EQ(writer->unsaved().messages, 2U);
    EXPECT_EQ(writer->unsaved().bytes, 2U);
}

TEST_F(PcapngWriterErrorTest, QueueIsBoundedAndItsGapIsOne) {
    start();
    medium.room = headSize;
    ASSERT_TRUE(append(1));
    ASSERT_FALSE(writer->flush());
    // 33554432 bytes of blocks: one of 36 and 15 of 2097152 + 32, which leaves 2096636; the 16th finds no
    // room, and from then on no message does.
    std::vector<std::uint8_t> large(2'097'152, 2);
    for (int i = 0; i < 15; ++i) {
        EXPECT_EQ(reasonOf(writer->append(Time(), large)), full);
        EXPECT_FALSE(writer->isDropping()) << i;
    }
    EXPECT_EQ(reasonOf(writer->append(Time(), large)), full);
    EXPECT_TRUE(writer->isDropping());
    EXPECT_EQ(reasonOf(append(3)), full);
    EXPECT_EQ(writer->droppedMessages(), 2U);
    EXPECT_EQ(writer->messages(), 16U);
    EXPECT_EQ(writer->unsaved().messages, 16U);

    medium.room = SIZE_MAX;
    ASSERT_TRUE(writer->flush());
    EXPECT_FALSE(writer->isDropping());
    ASSERT_TRUE(append(4));
    ASSERT_TRUE(writer->close());
    EXPECT_EQ(writer->droppedMessages(), 2U);
    EXPECT_THAT(numbers(), ElementsAre(1, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 4));
}

TEST_F(PcapngWriterErrorTest, ShortWritesAreNoError) {
    medium.longestWrite = 7;
    start();
    ASSERT_TRUE(append(1));
    ASSERT_TRUE(append(2));
    ASSERT_TRUE(writer->flush());
    EXPECT_THAT(numbers(), ElementsAre(1, 2));
}

TEST_F(PcapngWriterErrorTest, LongMessageIsQueuedAfterATemporaryErrorOnly) {
    // Above 128 KiB what has been gathered goes out ahead of the message.
    const std::vector<std::uint8_t> large(150'000, 2);
    start();
    medium.room = headSize;
    ASSERT_TRUE(append(1));
    EXPECT_EQ(reasonOf(writer->append(Time(), large)), full);
    EXPECT_EQ(writer->messages(), 2U);
    medium.room = SIZE_MAX;
    ASSERT_TRUE(writer->close());
    EXPECT_THAT(numbers(), ElementsAre(1, 2));

    medium = FakeOutputFile();
    start();
    medium.room = headSize;
    medium.fullError = EBADF;
    ASSERT_TRUE(append(1));
    EXPECT_EQ(reasonOf(writer->append(Time(), large)), "cannot write the recording: Bad file descriptor");
    EXPECT_EQ(writer->messages(), 1U);
}

} // namespace
} // namespace velmora
