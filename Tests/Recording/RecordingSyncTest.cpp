// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recording/PcapngWriterFixture.h"

#include <cerrno>
#include <vector>

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;

using RecordingSyncTest = PcapngWriterFixture;

TEST_F(RecordingSyncTest, SyncIsStartedForWhatIsNewAndOneAtATime) {
    start();
    ASSERT_TRUE(writer->sync());
    EXPECT_EQ(medium.syncsStarted, 1U) << "the head";
    ASSERT_TRUE(append(1));
    ASSERT_TRUE(writer->sync());
    EXPECT_EQ(medium.syncsStarted, 1U) << "the first is still under way";
    EXPECT_THAT(numbers(), ElementsAre(1)) << "the file has it all the same";
    medium.syncOutcome = 0;
    ASSERT_TRUE(writer->sync());
    EXPECT_EQ(medium.syncsStarted, 2U);
    medium.syncOutcome = 0;
    ASSERT_TRUE(writer->sync());
    ASSERT_TRUE(writer->sync());
    EXPECT_EQ(medium.syncsStarted, 2U) << "nothing new";
    ASSERT_TRUE(writer->close());
    EXPECT_EQ(medium.syncsWaitedFor, 1U);
}

TEST_F(RecordingSyncTest, DataOfAFailedSyncIsRewritten) {
    start();
    ASSERT_TRUE(append(1));
    ASSERT_TRUE(writer->sync());
    medium.syncOutcome = 0;
    ASSERT_TRUE(append(2));
    ASSERT_TRUE(writer->sync());
    ASSERT_TRUE(append(3));
    ASSERT_TRUE(writer->flush());
    EXPECT_THAT(numbers(), ElementsAre(1, 2, 3));
    // The second message was never synced, and the third is unknown.
    medium.syncOutcome = EIO;
    EXPECT_EQ(reasonOf(writer->sync()), broken);
    EXPECT_TRUE(writer->hasTemporaryError());
    EXPECT_THAT(numbers(), ElementsAre(1));
    EXPECT_EQ(writer->unsaved().messages, 2U);
    ASSERT_TRUE(writer->sync());
    EXPECT_FALSE(writer->hasTemporaryError());
    EXPECT_EQ(medium.syncsStarted, 3U);
    EXPECT_THAT(numbers(), ElementsAre(1, 2, 3));
}

TEST_F(RecordingSyncTest, FinalSyncIsRetried) {
    start();
    ASSERT_TRUE(writer->sync());
    medium.syncOutcome = 0;
    ASSERT_TRUE(append(1));
    ASSERT_TRUE(writer->sync());
    medium.syncError = EIO;
    ASSERT_TRUE(writer->close());
    EXPECT_EQ(medium.syncsWaitedFor, 2U);
    EXPECT_THAT(numbers(), ElementsAre(1));
}

TEST_F(RecordingSyncTest, FailedFinalSyncIsReportedWhereNothingCanBeRewritten) {
    start();
    ASSERT_TRUE(append(1));
    medium.syncError = ENOSPC;
    EXPECT_EQ(reasonOf(writer->close()), full);
    EXPECT_EQ(medium.syncsWaitedFor, 1U);
}

TEST_F(RecordingSyncTest, FailedCloseIsReportedUnlessAnErrorCameFirst) {
    start();
    ASSERT_TRUE(append(1));
    medium.closeError = EIO;
    EXPECT_EQ(reasonOf(writer->close()), "cannot close the recording: Input/output error");
    EXPECT_THAT(numbers(), ElementsAre(1));

    medium = FakeOutputFile();
    start();
    ASSERT_TRUE(append(1));
    medium.room = headSize;
    medium.closeError = EIO;
    EXPECT_EQ(reasonOf(writer->close()), full);
}

TEST_F(RecordingSyncTest, FileSystemWithoutSyncIsNoError) {
    start();
    ASSERT_TRUE(append(1));
    medium.syncError = EINVAL;
    ASSERT_TRUE(writer->close());
    EXPECT_THAT(numbers(), ElementsAre(1));
}

TEST_F(RecordingSyncTest, BoundsUnsyncedDataOnSlowStorage) {
    start();
    ASSERT_TRUE(writer->sync());
    // The sync does not finish while 9 MiB are written, one more than are kept.
    const std::vector<std::uint8_t> large(1 << 20, 7);
    for (int i = 0; i < 9; ++i)
        ASSERT_TRUE(writer->append(Time(), large));
    medium.syncOutcome = EIO;
    EXPECT_FALSE(writer->sync());
    ASSERT_TRUE(writer->close());
    EXPECT_EQ(numbers().size(), 9U) << "what is kept no longer stays in the file";
}

} // namespace
} // namespace velmora
