// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/PropertyList.h"
#include "Tests/PropertyLists/BinaryListFile.h"
#include "Tests/PropertyLists/PropertyListSamples.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono;

TEST(BinaryReader, HoldsToItsLimits) {
    const Buffer nested = listOf({hex("A1 00000001"), hex("D1 00000002 00000003"), hex("51 6B"), hex("A0")});
    EXPECT_EQ(reasonOf(nested, {.maximumDepth = 3}), "read");
    EXPECT_EQ(reasonOf(nested, {.maximumDepth = 2}), "offset 24: an array is nested deeper than 2");
    EXPECT_EQ(reasonOf(nested, {.maximumObjects = 4}), "read");
    EXPECT_EQ(reasonOf(nested, {.maximumObjects = 3}), "the list has more than 3 objects");
    EXPECT_EQ(reasonOf(nested, {.maximumObjects = 0}), "the list has more than 0 objects");
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
    EXPECT_EQ(reasonOf(list, {.maximumBytes = 16 << 20}),
              "offset 1036: text and data, repeated ones counted, have more than 16777216 bytes");
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
        // 8 for the header, 33 for the array, 103 for the object, 8 for the table, 32 for the trailer; 800 of
        // content.
        const Buffer list = listOf({Data(Buffer(references)), Data(Buffer(object))});
        EXPECT_EQ(reasonOf(list, {.maximumBytes = 184}),
                  "offset 41: text and data, repeated ones counted, have more than 184 bytes");
        EXPECT_EQ(reasonOf(list, {.maximumBytes = 800}), "read");
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
    EXPECT_EQ(reasonOf(listOf(arrays)), "the list has more than 1000000 objects");
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
