// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/KeptRecords.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

namespace velmora {
namespace {

/// Keeps records of one byte and notes what is written.
class KeptRecordsTest : public testing::Test {
protected:
    /// Whether all has to be written now.
    bool keep(std::size_t view, char byte, KeptRecords::Parts parts = 1) {
        return records.keep(view, std::vector<std::uint8_t>{static_cast<std::uint8_t>(byte)}, parts);
    }
    /// "1x 0y" for the view and byte of each record, in the order in which they were written.
    std::string written() {
        std::string result;
        records.writeAll([&result](std::size_t view, Bytes bytes) {
            result += (result.empty() ? "" : " ") + std::to_string(view) + static_cast<char>(bytes[0]);
        });
        return result;
    }

    KeptRecords records{3};
};

TEST_F(KeptRecordsTest, WritesTheLatestOfEachViewInTheOrderOfArrival) {
    EXPECT_EQ(written(), "");
    keep(2, 'a');
    keep(0, 'b');
    keep(1, 'c');
    keep(2, 'd');
    EXPECT_EQ(written(), "0b 1c 2d");
    EXPECT_EQ(written(), "");
}

TEST_F(KeptRecordsTest, WhatWasNeverWrittenHasToBeWrittenAtOnce) {
    EXPECT_TRUE(keep(0, 'a'));
    EXPECT_EQ(written(), "0a");
    EXPECT_FALSE(keep(0, 'b'));
    EXPECT_TRUE(keep(0, 'c', 3));
    EXPECT_EQ(written(), "0c");
    EXPECT_FALSE(keep(0, 'd', 2));
    EXPECT_TRUE(keep(1, 'e'));
}

TEST_F(KeptRecordsTest, ARecordWithFewerPartsWouldLoseSome) {
    EXPECT_FALSE(records.wouldLose(0, 0));
    keep(0, 'a', 6);
    EXPECT_FALSE(records.wouldLose(0, 6));
    EXPECT_FALSE(records.wouldLose(0, 7));
    EXPECT_TRUE(records.wouldLose(0, 4));
    EXPECT_TRUE(records.wouldLose(0, 1));
    EXPECT_FALSE(records.wouldLose(1, 0));
    EXPECT_EQ(written(), "0a");
    EXPECT_FALSE(records.wouldLose(0, 0)); // it has been written
}

TEST_F(KeptRecordsTest, DropsWhatAnotherViewReplaces) {
    keep(0, 'a');
    keep(1, 'b');
    keep(2, 'c');
    records.dropAllBut(1);
    EXPECT_EQ(written(), "1b");
}

TEST_F(KeptRecordsTest, AnotherDisplayBeginsAgain) {
    keep(0, 'a');
    EXPECT_EQ(written(), "0a");
    keep(1, 'b');
    records.clear();
    EXPECT_EQ(written(), "");
    EXPECT_TRUE(keep(0, 'c'));
}

TEST_F(KeptRecordsTest, ARecordThatCannotBeWrittenStaysWithThoseAfterIt) {
    keep(0, 'a');
    keep(1, 'b');
    keep(2, 'c');
    int calls = 0;
    const auto failSecond = [&calls](std::size_t, Bytes) {
        if (++calls == 2)
            throw std::runtime_error("no memory");
    };
    EXPECT_THROW(records.writeAll(failSecond), std::runtime_error);
    EXPECT_EQ(written(), "1b 2c");
}

} // namespace
} // namespace velmora
