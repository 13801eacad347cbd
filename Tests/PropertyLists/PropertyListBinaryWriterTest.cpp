// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/PropertyList.h"
#include "Tests/PropertyLists/PropertyListSamples.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

#include <cmath>
#include <string>

namespace velmora {
namespace {

using namespace std::chrono;

TEST(BinaryWriter, WritesTheSmallestNumbersThatDo) {
    const auto list =
        writeBinaryPropertyList(dictionaryOf({{"k", "k"}, {"n", arrayOf({255, 256, -1, true})}}));
    ASSERT_TRUE(list) << list.reason();
    EXPECT_EQ(Data::copyOf(*list), hex(R"(
        62 70 6C 69 73 74 30 30     // bplist00
        D2 01 02 01 03              // 8: object 0, keys 1 and 2, values 1 and 3
        51 6B                       // 13: object 1, "k", key and value
        51 6E                       // 15: object 2, "n"
        A4 04 05 06 07              // 17: object 3
        10 FF                       // 22
        11 0100                     // 24
        13 FFFFFFFFFFFFFFFF         // 27
        09                          // 36
        08 0D 0F 11 16 18 1B 24     // 37: the offset table
        00 00 00 00 00 00           // unused
        01 01                       // sizes of offset and reference
        00 00 00 00 00 00 00 08     // objects
        00 00 00 00 00 00 00 00     // root
        00 00 00 00 00 00 00 25     // the table's offset
    )"));
}

TEST(BinaryWriter, WritesCountsFrom15OnAsNumbers) {
    const auto list = writeBinaryPropertyList(std::string(15, 'x'));
    ASSERT_TRUE(list) << list.reason();
    EXPECT_EQ(Data::copyOf(Bytes(*list).subspan(8, 4)), hex("5F 10 0F 78"));
    const auto wide = writeBinaryPropertyList("\xC3\xA9\xF0\x9F\x93\xB6");
    ASSERT_TRUE(wide) << wide.reason();
    EXPECT_EQ(Data::copyOf(Bytes(*wide).subspan(8, 7)), hex("63 00E9 D83D DCF6"));
}

TEST(BinaryWriter, RefusesWhatTheFormCannotCarry) {
    const auto writingReasonOf = [](const Value& value) {
        const auto list = writeBinaryPropertyList(value);
        return list ? "written" : list.reason();
    };
    EXPECT_EQ(writingReasonOf(Value()), "there is no value to write");
    EXPECT_EQ(writingReasonOf(arrayOf({Value()})), "there is no value to write");
    EXPECT_EQ(writingReasonOf("ab\xFF"), "a string is not UTF-8 at its offset 2");
    EXPECT_EQ(writingReasonOf(dictionaryOf({{"\x80", 1}})), "a string is not UTF-8 at its offset 0");
    EXPECT_EQ(writingReasonOf(Date(sys_days{year{10000} / 1 / 1})),
              "a date lies outside the years 0001 to 9999");
    EXPECT_EQ(writingReasonOf(nestedArrays(128)), "written");
    EXPECT_EQ(writingReasonOf(nestedArrays(129)), "the value is nested deeper than 128");
    EXPECT_EQ(writingReasonOf(std::string("\x01\0", 2)), "written")
        << "control characters are no matter here";

    const auto cycle = makeDictionary();
    cycle->set("itself", cycle);
    EXPECT_EQ(writingReasonOf(cycle), "the value is nested deeper than 128");
    cycle->remove("itself");
}

TEST(BinaryRoundTrip, GivesTheSameValueAgain) {
    for (const Value& value : {everyKind(), manyEntries(), nestedArrays(128), Value("bare"),
                               Value(makeArray()), Value(std::string("\0\x01\x1F", 3))}) {
        const auto list = writeBinaryPropertyList(value);
        ASSERT_TRUE(list) << list.reason();
        const auto read = readPropertyList(*list, largeLimits);
        ASSERT_TRUE(read) << read.reason();
        EXPECT_TRUE(*read == value);
    }
}

TEST(BinaryRoundTrip, KeepsNotANumber) {
    const auto list = writeBinaryPropertyList(NAN);
    ASSERT_TRUE(list) << list.reason();
    const auto read = readPropertyList(*list);
    ASSERT_TRUE(read) << read.reason();
    ASSERT_TRUE(read->asReal());
    EXPECT_TRUE(std::isnan(*read->asReal()));
}

} // namespace
} // namespace velmora
