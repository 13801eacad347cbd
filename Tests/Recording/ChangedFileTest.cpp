// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recording/PcapngWriterFixture.h"

#include <vector>

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using Kind = OutputFile::Change::Kind;

/// A recording whose file others change.
class ChangedFileTest : public PcapngWriterFixture {
protected:
    /// Continues in a second disk, and looks at that from then on.
    Result<Done> moveOn() {
        const Result<Done> result =
            writer->continueIn(std::make_unique<FakeRecordingFile>(_second), "the second");
        EXPECT_TRUE(medium.closed);
        return result;
    }
    std::vector<int> secondNumbers() {
        std::swap(medium.content, _second.content);
        std::vector<int> found = numbers();
        std::swap(medium.content, _second.content);
        return found;
    }

    FakeOutputFile _second;
};

TEST_F(ChangedFileTest, MessagesWaitForAnotherFile) {
    start();
    ASSERT_TRUE(append(1));
    ASSERT_TRUE(writer->flush());
    medium.change = {Kind::Removed, 0};
    ASSERT_TRUE(append(2));
    EXPECT_EQ(reasonOf(writer->flush()), "the recording was removed");
    EXPECT_EQ(writer->change(), Kind::Removed);
    EXPECT_EQ(reasonOf(append(3)), "the recording was removed");
    EXPECT_EQ(writer->unsaved().messages, 2U);
    EXPECT_THAT(numbers(), ElementsAre(1)) << "nothing is written to the file any more";
    ASSERT_TRUE(moveOn());
    EXPECT_EQ(writer->change(), Kind::None);
    ASSERT_TRUE(append(4));
    ASSERT_TRUE(writer->close());
    EXPECT_THAT(secondNumbers(), ElementsAre(2, 3, 4));
    EXPECT_EQ(writer->messages(), 4U);
    EXPECT_EQ(writer->messagesOfFile(), 3U);
}

TEST_F(ChangedFileTest, WhatWasWrittenWhileItChangedIsWrittenAgain) {
    start();
    ASSERT_TRUE(writer->sync()); // what is not synced is kept from now on
    ASSERT_TRUE(append(1));
    ASSERT_TRUE(append(2));
    ASSERT_TRUE(writer->sync());
    // The first message alone is left of the file.
    medium.change = {Kind::Truncated, headSize + blockSize + 5};
    EXPECT_EQ(reasonOf(writer->sync()), "the recording was truncated");
    EXPECT_EQ(writer->unsaved().messages, 1U);
    ASSERT_TRUE(moveOn());
    EXPECT_THAT(secondNumbers(), ElementsAre(2));
}

TEST_F(ChangedFileTest, WhatIsStillInAMovedFileIsNotRepeated) {
    start();
    ASSERT_TRUE(writer->sync());
    ASSERT_TRUE(append(1));
    ASSERT_TRUE(writer->sync());
    ASSERT_TRUE(append(2));
    medium.change = {Kind::Moved, headSize + blockSize};
    EXPECT_EQ(reasonOf(writer->sync()), "the recording was moved away");
    ASSERT_TRUE(moveOn());
    EXPECT_THAT(numbers(), ElementsAre(1));
    EXPECT_THAT(secondNumbers(), ElementsAre(2));
    // The sync of the first file says nothing about the second.
    medium.syncOutcome = EIO;
    ASSERT_TRUE(writer->sync());
    EXPECT_EQ(_second.syncsStarted, 1U);
}

TEST_F(ChangedFileTest, FileWithoutItsHeadYetIsFollowedByOneWithAHead) {
    medium.room = 0;
    start();
    EXPECT_TRUE(writer->hasTemporaryError());
    ASSERT_FALSE(append(1));
    medium.room = SIZE_MAX;
    medium.change = {Kind::Removed, 0};
    EXPECT_EQ(reasonOf(writer->flush()), "the recording was removed");
    ASSERT_TRUE(moveOn());
    EXPECT_THAT(secondNumbers(), ElementsAre(1));
}

TEST_F(ChangedFileTest, ErrorsOfTheNextFileAreTheWritersOwn) {
    start();
    medium.change = {Kind::Replaced, headSize};
    ASSERT_TRUE(append(1));
    ASSERT_FALSE(writer->flush());
    _second.room = headSize + 4;
    EXPECT_EQ(reasonOf(moveOn()), "cannot write the second: No space left on device");
    EXPECT_TRUE(writer->hasTemporaryError());
    EXPECT_EQ(_second.content.size(), headSize);
    _second.room = SIZE_MAX;
    ASSERT_TRUE(writer->flush());
    EXPECT_THAT(secondNumbers(), ElementsAre(1));
}

TEST_F(ChangedFileTest, UnsavedMessagesOfAChangedFileAreAFailureAtTheEnd) {
    start();
    ASSERT_TRUE(append(1));
    medium.change = {Kind::Altered, 0};
    EXPECT_EQ(reasonOf(writer->close()), "the recording was written to by another program");
    EXPECT_EQ(writer->unsaved().messages, 1U);
}

} // namespace
} // namespace velmora
