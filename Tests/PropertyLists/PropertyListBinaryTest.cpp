// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/PropertyList.h"
#include "Tests/PropertyLists/BinaryListFile.h"
#include "Tests/PropertyLists/PropertyListSamples.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

#include <string>

namespace velmora {
namespace {

using namespace std::chrono;

struct Object {
    std::string name;
    std::string hexText;
    Value value;
};

class BinaryObject : public testing::TestWithParam<Object> {};

TEST_P(BinaryObject, IsRead) {
    const auto value = readPropertyList(listOf({hex(GetParam().hexText)}));
    ASSERT_TRUE(value) << value.reason();
    EXPECT_EQ(*value, GetParam().value);
}

const Object objects[] = {
    {"False", "08", false},
    {"True", "09", true},
    {"Integer1Byte", "10 FF", 255},
    {"Integer2Bytes", "11 FFFE", 65534},
    {"Integer4Bytes", "12 FFFFFFFE", std::int64_t{4294967294}},
    {"Integer8Bytes", "13 7FFFFFFFFFFFFFFF", std::numeric_limits<std::int64_t>::max()},
    {"Integer8BytesNegative", "13 FFFFFFFFFFFFFFFE", -2},
    {"Integer16Bytes", "14 0000000000000000 7FFFFFFFFFFFFFFF", std::numeric_limits<std::int64_t>::max()},
    {"Integer16BytesNegative", "14 FFFFFFFFFFFFFFFF 8000000000000000",
     std::numeric_limits<std::int64_t>::min()},
    {"Real4Bytes", "22 3FC00000", 1.5},
    {"Real8Bytes", "23 BFF8000000000000", -1.5},
    {"DateEpoch", "33 0000000000000000", Date(sys_days{year{2001} / 1 / 1})},
    {"DateFractionIsFloored", "33 3FF8000000000000", Date(sys_days{year{2001} / 1 / 1} + 1s)},      // 1.5
    {"DateFractionBeforeTheEpoch", "33 BFE0000000000000", Date(sys_days{year{2001} / 1 / 1} - 1s)}, // -0.5
    {"DataEmpty", "40", Data()},
    {"DataShort", "43 010203", dataOf({1, 2, 3})},
    {"DataCountBehind", "4F 10 03 010203", dataOf({1, 2, 3})},
    {"StringASCII", "53 616263", "abc"},
    {"StringCountOf8Bytes", "5F 13 0000000000000003 616263", "abc"},
    {"StringUTF16", "62 00E9 20AC", "\xC3\xA9\xE2\x82\xAC"},
    {"StringSurrogatePair", "62 D83D DCF6", "\xF0\x9F\x93\xB6"},
    {"ArrayEmpty", "A0", makeArray()},
    {"DictionaryEmpty", "D0", makeDictionary()},
};
INSTANTIATE_TEST_SUITE_P(Kinds, BinaryObject, testing::ValuesIn(objects),
                         [](const auto& parameter) { return parameter.param.name; });

TEST(BinaryReader, ReadsContainersInOrder) {
    const auto list = listOf({
        hex("D2 00000001 00000002 00000003 00000004"), // keys 1 and 2, values 3 and 4
        hex("51 62"),                                  // b
        hex("51 61"),                                  // a
        hex("A2 00000001 00000004"),
        hex("10 07"),
    });
    const auto value = readPropertyList(list);
    ASSERT_TRUE(value) << value.reason();
    EXPECT_EQ(*value, dictionaryOf({{"b", arrayOf({"b", 7})}, {"a", 7}}));
    EXPECT_EQ(value->asDictionary()->begin()->key, "b");
}

TEST(BinaryReader, ObjectsReferencedTwiceAreIndependent) {
    const auto value = readPropertyList(listOf({hex("A2 00000001 00000001"), hex("A0")}));
    ASSERT_TRUE(value) << value.reason();
    const Array& array = *value->asArray();
    ASSERT_EQ(array.size(), 2U);
    EXPECT_NE(array[0].asArray(), array[1].asArray());
}

struct Bad {
    std::string name;
    std::string hexText;
    std::string reason;
};

class BinaryBad : public testing::TestWithParam<Bad> {};

// The object is at offset 8 and the table right after it.
TEST_P(BinaryBad, IsRefusedWithAReason) {
    EXPECT_EQ(reasonOf(listOf({hex(GetParam().hexText)})), GetParam().reason);
}

const Bad badObjects[] = {
    {"Null", "00", "offset 8: marker 0x00 stands for no value that is read"},
    {"Fill", "0F", "offset 8: marker 0x0F stands for no value that is read"},
    {"UID", "80 01", "offset 8: marker 0x80 stands for no value that is read"},
    {"Set", "C1 00000000", "offset 8: marker 0xC1 stands for no value that is read"},
    {"UTF8String", "71 61", "offset 8: marker 0x71 stands for no value that is read"},
    {"Unused", "F0", "offset 8: marker 0xF0 stands for no value that is read"},
    {"IntegerTooWide", "15", "offset 8: an integer has marker 0x15, not 0x10 to 0x14"},
    {"IntegerCutOff", "13 00000000000000", "offset 8: the object with marker 0x13 needs 8 bytes, 7 are left"},
    {"Integer16BytesAbove", "14 0000000000000000 8000000000000000",
     "offset 8: an integer of 16 bytes does not fit 64 bits"},
    {"Integer16BytesBelow", "14 FFFFFFFFFFFFFFFF 7FFFFFFFFFFFFFFF",
     "offset 8: an integer of 16 bytes does not fit 64 bits"},
    {"RealOfTwoBytes", "21 0000", "offset 8: a real has marker 0x21, not 0x22 or 0x23"},
    {"RealCutOff", "22 0000", "offset 8: the object with marker 0x22 needs 4 bytes, 2 are left"},
    {"DateOfFourBytes", "32 00000000", "offset 8: a date has marker 0x32, not 0x33"},
    {"DateCutOff", "33 00", "offset 8: the object with marker 0x33 needs 8 bytes, 1 are left"},
    {"DateNaN", "33 7FF8000000000000", "offset 8: a date lies outside the years 0001 to 9999"},
    {"DateInfinite", "33 FFF0000000000000", "offset 8: a date lies outside the years 0001 to 9999"},
    {"DateFarAway", "33 4330000000000000", "offset 8: a date lies outside the years 0001 to 9999"}, // 2^52
    {"DataPastTheEnd", "43 0102", "offset 8: data has 3 bytes, 2 are left"},
    {"DataHuge", "4F 13 FFFFFFFFFFFFFFFF", "offset 8: data has 18446744073709551615 bytes, 0 are left"},
    {"StringPastTheEnd", "53 6162", "offset 8: a string has 3 bytes, 2 are left"},
    {"StringHuge", "5F 13 7FFFFFFFFFFFFFFF 61",
     "offset 8: a string has 9223372036854775807 bytes, 1 are left"},
    {"StringNotASCII", "53 61C3A9", "offset 10: an ASCII string holds 0xC3"},
    {"UTF16PastTheEnd", "62 0061 00", "offset 8: a string has 2 UTF-16 units, 3 bytes are left"},
    {"UTF16Huge", "6F 13 8000000000000001 0061",
     "offset 8: a string has 9223372036854775809 UTF-16 units, 2 bytes are left"},
    {"UTF16HighAlone", "62 D83D 0061", "offset 9: a UTF-16 string holds half a surrogate pair"},
    {"UTF16HighLast", "62 0061 D83D", "offset 11: a UTF-16 string holds half a surrogate pair"},
    {"UTF16LowAlone", "61 DCF6", "offset 9: a UTF-16 string holds half a surrogate pair"},
    {"CountMissing", "5F", "offset 9: the count is missing"},
    {"CountNoInteger", "5F 50", "offset 9: the count has marker 0x50, not 0x10 to 0x13"},
    {"CountCutOff", "5F 12 0000", "offset 9: the count is cut off"},
    {"ArrayPastTheEnd", "A2 00000000 000000", "offset 8: an array has 2 entries, 7 bytes are left"},
    {"ArrayHuge", "AF 13 4000000000000001 00000000",
     "offset 8: an array has 4611686018427387905 entries, 4 bytes are left"},
    {"DictionaryPastTheEnd", "D1 00000000", "offset 8: a dictionary has 1 entries, 4 bytes are left"},
    {"DictionaryHuge", "DF 13 2000000000000001 00000000 00000000",
     "offset 8: a dictionary has 2305843009213693953 entries, 8 bytes are left"},
    {"ReferenceTooLarge", "A1 00000001", "offset 9: an array refers to object 1 of 1"},
    {"ArrayInItself", "A1 00000000", "offset 8: an array contains itself"},
    {"DictionaryAsItsKey", "D1 00000000 00000000", "offset 8: a dictionary contains itself"},
};
INSTANTIATE_TEST_SUITE_P(Objects, BinaryBad, testing::ValuesIn(badObjects),
                         [](const auto& parameter) { return parameter.param.name; });

TEST(BinaryReader, NeedsStringKeys) {
    EXPECT_EQ(reasonOf(listOf({hex("D1 00000001 00000001"), hex("10 01")})),
              "offset 9: a dictionary's key is of the kind integer, not string");
}

TEST(BinaryReader, FindsACycleThroughSeveralObjects) {
    EXPECT_EQ(reasonOf(listOf({hex("A1 00000001"), hex("D1 00000002 00000000"), hex("51 6B")})),
              "offset 8: an array contains itself");
}

TEST(BinaryReader, ChecksTheTrailer) {
    const std::vector<Data> one = {hex("10 01")}; // offsets: object 8, table 10, trailer 14
    EXPECT_EQ(reasonOf(listOf(one)), "read");
    EXPECT_EQ(reasonOf(listOf(one, {.offsetSize = 0})), "offset 20: offsets have 0 bytes, not 1 to 8");
    EXPECT_EQ(reasonOf(listOf(one, {.offsetSize = 9})), "offset 20: offsets have 9 bytes, not 1 to 8");
    EXPECT_EQ(reasonOf(listOf(one, {.referenceSize = 0})), "offset 21: references have 0 bytes, not 1 to 8");
    EXPECT_EQ(reasonOf(listOf(one, {.referenceSize = 255})),
              "offset 21: references have 255 bytes, not 1 to 8");
    EXPECT_EQ(reasonOf(listOf(one, {.objectCount = 0})), "offset 30: the root is object 0 of 0");
    EXPECT_EQ(reasonOf(listOf(one, {.objectCount = 2})),
              "offset 22: 2 offsets of 4 bytes do not fit the table's 4");
    EXPECT_EQ(reasonOf(listOf(one, {.objectCount = 0x4000000000000001})),
              "offset 22: 4611686018427387905 offsets of 4 bytes do not fit the table's 4");
    EXPECT_EQ(reasonOf(listOf(one, {.topObject = 1})), "offset 30: the root is object 1 of 1");
    EXPECT_EQ(reasonOf(listOf(one, {.table = 7})),
              "offset 38: the offset table begins at 7, not from 8 to 14");
    EXPECT_EQ(reasonOf(listOf(one, {.table = 15})),
              "offset 38: the offset table begins at 15, not from 8 to 14");
    EXPECT_EQ(reasonOf(listOf(one, {.table = 0xFFFFFFFFFFFFFFFF})),
              "offset 38: the offset table begins at 18446744073709551615, not from 8 to 14");
    EXPECT_EQ(reasonOf(listOf(one, {.table = 11})),
              "offset 22: 1 offsets of 4 bytes do not fit the table's 3");
    EXPECT_EQ(reasonOf(listOf({}, {.objectCount = 1})),
              "offset 16: 1 offsets of 4 bytes do not fit the table's 0");
}

TEST(BinaryReader, ChecksEveryOffset) {
    Buffer list = listOf({hex("10 01")});
    list[13] = 7; // the last byte of the one offset
    EXPECT_EQ(reasonOf(list), "offset 10: object 0 lies at 7, not from 8 to 9");
    list[13] = 10;
    EXPECT_EQ(reasonOf(list), "offset 10: object 0 lies at 10, not from 8 to 9");
    list[10] = 0xFF;
    EXPECT_EQ(reasonOf(list), "offset 10: object 0 lies at 4278190090, not from 8 to 9");
    EXPECT_EQ(reasonOf(listOf({Data()})), "offset 8: object 0 lies at 8, not from 8 to 7");
}

TEST(BinaryReader, NeedsHeaderAndTrailer) {
    EXPECT_EQ(reasonOf(bytesOf("bplist00")),
              "the list has 8 bytes, fewer than the 40 of a header and a trailer");
    Buffer list = listOf({hex("10 01")});
    list[7] = '1';
    EXPECT_EQ(reasonOf(list), "offset 0: the list does not begin with \"bplist00\"");
}

} // namespace
} // namespace velmora
