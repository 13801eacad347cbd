// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/Record.h"

#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(RecordTest, ReadsEachWidthAndSignLittleEndian) {
    const Data data = hex("80 FF 01 02 FE FF FF FF");
    const Record record(data);
    EXPECT_EQ(record.u8(0), 128);
    EXPECT_EQ(record.i8(0), -128);
    EXPECT_EQ(record.u16(1), 0x01FF);
    EXPECT_EQ(record.i16(0), -128); // 0xFF80
    EXPECT_EQ(record.u32(4), 0xFFFFFFFEu);
    EXPECT_EQ(record.i32(4), -2);
    EXPECT_EQ(record.u16BigEndian(2), 0x0102);
}

TEST(RecordTest, ReadsBitsAcrossBytes) {
    // Byte 0 = 1010 0101, byte 1 = 0011 1100, byte 2 = 0000 0001.
    const Data data = hex("A5 3C 01");
    const Record record(data);
    EXPECT_EQ(record.bits(0, 0, 4), 0x5u);
    EXPECT_EQ(record.bits(0, 4, 4), 0xAu);
    EXPECT_EQ(record.bits(0, 7, 2), 0x1u);   // bit 7 = 1, byte 1's bit 0 = 0
    EXPECT_EQ(record.bits(0, 5, 9), 0x1E5u); // 101 below 111100: 111100101
    EXPECT_EQ(record.bits(0, 0, 17), 0x13CA5u);
    EXPECT_EQ(record.bits(2, 0, 1), 1u);
}

TEST(RecordTest, ReadOutsideThrowsAndTouchesNothing) {
    const Data data = hex("01 02 03");
    const Record record(data);
    EXPECT_THROW(static_cast<void>(record.u8(3)), std::out_of_range);
    EXPECT_THROW(static_cast<void>(record.u16(2)), std::out_of_range);
    EXPECT_THROW(static_cast<void>(record.u32(0)), std::out_of_range);
    EXPECT_THROW(static_cast<void>(record.bits(2, 1, 8)), std::out_of_range);
    EXPECT_THROW(static_cast<void>(record.u8(static_cast<std::size_t>(-1))), std::out_of_range);
    EXPECT_THROW(static_cast<void>(record.part(2, 2)), std::out_of_range);
    EXPECT_EQ(record.part(1, 2).u8(1), 3);
}

struct Holding {
    const char* odd;
    std::size_t size;
    std::size_t count;
    std::size_t whole;
};

class CountedListSizeTest : public testing::TestWithParam<Holding> {};

TEST_P(CountedListSizeTest, CountsCompleteEntries) {
    const std::vector<std::uint8_t> bytes(GetParam().size);
    const CountedList list(Record(Bytes(bytes)), 4, 3, GetParam().count); // three bytes each, from 4 on
    EXPECT_EQ(list.count(), GetParam().count);
    EXPECT_EQ(list.completeCount(), GetParam().whole);
    EXPECT_EQ(list.isComplete(), list.completeCount() == list.count());
}

INSTANTIATE_TEST_SUITE_P(
    , CountedListSizeTest,
    testing::Values(Holding{"JustHoldsItsEntries", 10, 2, 2}, Holding{"ABytesLessHoldsOneLess", 9, 2, 1},
                    Holding{"HoldsMoreThanItAnnounces", 30, 2, 2}, Holding{"NoRoomForOne", 6, 255, 0},
                    Holding{"EndsBeforeTheFirst", 3, 255, 0}, Holding{"NoneAnnounced", 10, 0, 0}),
    [](const auto& test) { return std::string(test.param.odd); });

TEST(CountedListTest, EntryAtOrBeyondTheCountRaises) {
    const Data data = hex("02 0A 0B 0C 0D 0E");
    const CountedList list(Record(data), 1, 2, 2);
    EXPECT_EQ(list[0].u8(0), 0x0A);
    EXPECT_EQ(list[1].u8(1), 0x0D);
    EXPECT_THROW(static_cast<void>(list[2]), ArrayOutOfBoundsException);
    const CountedList overrun(Record(data), 1, 2, 9);
    EXPECT_THROW(static_cast<void>(overrun[2]), ArrayOutOfBoundsException); // counted, but not held
}

TEST(CountedListTest, OverlappingEntriesAreMeasuredByTheirLength) {
    const std::vector<std::uint8_t> bytes(12);
    // Stride 3, six bytes each: entries at 0, 3 and 6; one at 9 would end at 15.
    EXPECT_EQ(CountedList(Record(Bytes(bytes)), 0, 3, 6, 9).completeCount(), 3u);
}

TEST(CountedListTest, ExceptionIsAStandardOne) {
    const ArrayOutOfBoundsException exception;
    EXPECT_STREQ(static_cast<const std::exception&>(exception).what(), "array index out of bounds");
}

} // namespace
} // namespace velmora
