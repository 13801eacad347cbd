// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/PropertyList.h"
#include "Tests/PropertyLists/BinaryListFile.h"
#include "Tests/PropertyLists/PropertyListSamples.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono;

TEST(BinaryReader, HoldsToItsLimits) {
    const Buffer nested = listOf({hex("A1 00000001"), hex("D1 00000002 00000003"), hex("51 6B"), hex("A0")});
    EXPECT_EQ(reasonOf(nested, {.maximumDepth = 3}), "read");
    EXPECT_EQ(reasonOf(nested, {.maximumDepth = 2}), "offset 24: an array is nested deeper than 2");
    EXPECT_EQ(reasonOf(nested, {.maximumObjects = 4}), "read");
    EXPECT_EQ(reasonOf(nested, {.maximumObjects = 3}),
              "the list has more than 3 objects, repeated ones counted");
    EXPECT_EQ(reasonOf(nested, {.maximumObjects = 0}),
              "the list has more than 0 objects, repeated ones counted");
    EXPECT_EQ(reasonOf(nested, {.maximumBytes = nested.size()}), "read");
    EXPECT_EQ(reasonOf(nested, {.maximumBytes = 72}), "the list has 73 bytes, more than 72");
}

TEST(BinaryReader, CountsRepeatedText) {
    Buffer references = {0xAF, 0x11, 0x01, 0x00}; // an array of 256
    for (int i = 0; i < 256; ++i)
        appendBigEndian(references, 1, 4);
    Buffer text = {0x5F, 0x12};
    appendBigEndian(text, 1 << 20, 4);
    text.insert(text.end(), 1 << 20, 'x');
    const Buffer list = listOf({Data(std::move(references)), Data(std::move(text))});
    EXPECT_EQ(reasonOf(list, {.maximumMemory = 16 << 20}),
              "the list takes more than 16777216 bytes of memory, repeated text and data counted");
}

TEST(BinaryReader, CountsRepeatedTextOfEveryForm) {
    Buffer references = {0xA8};
    for (int i = 0; i < 8; ++i)
        appendBigEndian(references, 1, 4);
    Buffer data = {0x4F, 0x10, 100};
    data.insert(data.end(), 100, 0xFF);
    Buffer utf16 = {0x6F, 0x10, 50};
    for (int i = 0; i < 50; ++i)
        appendBigEndian(utf16, 0x00E9, 2); // two bytes as UTF-8
    for (const Buffer& object : {data, utf16}) {
        // 9 values of 256 bytes each and 800 of content.
        const Buffer list = listOf({Data(Buffer(references)), Data(Buffer(object))});
        EXPECT_EQ(reasonOf(list, {.maximumMemory = 3103}),
                  "the list takes more than 3103 bytes of memory, repeated text and data counted");
        EXPECT_EQ(reasonOf(list, {.maximumMemory = 3104}), "read");
    }
}

TEST(BinaryReader, RefusesAMillionNestedArrays) {
    std::vector<Data> arrays;
    for (std::uint64_t i = 0; i < 1'000'000; ++i) {
        Buffer array = {0xA1};
        appendBigEndian(array, i + 1, 4);
        arrays.emplace_back(std::move(array));
    }
    arrays.push_back(hex("A0"));
    EXPECT_EQ(reasonOf(listOf(arrays)), "offset 648: an array is nested deeper than 128");
}

TEST(BinaryReader, RefusesExponentialFanOut) {
    // Each of 100 arrays holds the next one ten times: 10^100 values in 4 kB.
    std::vector<Data> arrays;
    for (std::uint64_t i = 0; i < 100; ++i) {
        Buffer array = {0xAA};
        for (int reference = 0; reference < 10; ++reference)
            appendBigEndian(array, i + 1, 4);
        arrays.emplace_back(std::move(array));
    }
    arrays.push_back(hex("53 6C6F6C"));
    EXPECT_EQ(reasonOf(listOf(arrays)), "the list has more than 100000 objects, repeated ones counted");
}

/// Four arrays in one another, each but the last with `fan` references to the next one, which is empty.
Buffer fanOut(std::size_t fan) {
    std::vector<Data> arrays;
    for (std::uint64_t i = 1; i <= 3; ++i) {
        Buffer array = {0xAF, 0x10, static_cast<std::uint8_t>(fan)};
        for (std::size_t reference = 0; reference < fan; ++reference)
            appendBigEndian(array, i, 4);
        arrays.emplace_back(std::move(array));
    }
    arrays.push_back(hex("A0"));
    return listOf(arrays);
}

TEST(BinaryReader, AMessageMakesAtMostAHundredThousandValues) {
    // 1 + 45 + 45² + 45³ are 93,196 values, 1 + 47 + 47² + 47³ are 106,080, from some 650 bytes.
    EXPECT_EQ(reasonOf(fanOut(45), messageLimits), "read");
    CapturedLog log;
    EXPECT_EQ(reasonOf(fanOut(47)), "the list has more than 100000 objects, repeated ones counted");
    EXPECT_THAT(log.lines(), testing::IsEmpty()) << "a reader that has the reason reports it itself";
    EXPECT_EQ(reasonOf(fanOut(47), messageLimits),
              "the list has more than 100000 objects, repeated ones counted");
    EXPECT_THAT(log.lines(),
                testing::ElementsAre(CapturedLog::Line{
                    3, "Malformed message: the list has more than 100000 objects, repeated ones counted"}));
}

TEST(BinaryReader, AMessageTakesAtMost64Mebibytes) {
    // The array and so many references to a text of 1 MiB: 63 take less than 64 MiB, 64 take more.
    for (const int repetitions : {63, 64}) {
        Buffer array = {0xAF, 0x10, static_cast<std::uint8_t>(repetitions)};
        for (int i = 0; i < repetitions; ++i)
            appendBigEndian(array, 1, 4);
        Buffer text = {0x5F, 0x12};
        appendBigEndian(text, 1 << 20, 4);
        text.insert(text.end(), 1 << 20, 'x');
        EXPECT_EQ(reasonOf(listOf({Data(std::move(array)), Data(std::move(text))})),
                  repetitions == 63 ? "read"
                                    : "the list takes more than 67108864 bytes of memory, repeated text and "
                                      "data counted");
    }
}

TEST(BinaryReader, GivesAReasonForEveryTruncation) {
    const auto list = writeBinaryPropertyList(everyKind());
    ASSERT_TRUE(list) << list.reason();
    for (std::size_t size = 0; size < list->size(); ++size) {
        const auto value = readPropertyList(Bytes(*list).first(size));
        ASSERT_FALSE(value) << size;
        EXPECT_FALSE(value.reason().empty());
    }
}

TEST(BinaryReader, GivesAReasonOrAValueForEveryChangedByte) {
    const auto list = writeBinaryPropertyList(everyKind());
    ASSERT_TRUE(list) << list.reason();
    for (std::size_t i = 0; i < list->size(); ++i)
        for (const int flipped : {0x01, 0x02, 0x04, 0x08, 0x10, 0x20, 0x40, 0x80, 0xFF}) {
            Buffer damaged = *list;
            damaged[i] = static_cast<std::uint8_t>(damaged[i] ^ flipped);
            // Given as an exact buffer of its own, so that a read past its end would show.
            const auto value = readBinaryPropertyList(damaged, {});
            if (!value) {
                EXPECT_FALSE(value.reason().empty());
            }
        }
}

} // namespace
} // namespace velmora
