// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/PropertyList.h"
#include "Tests/PropertyLists/XMLPropertyListText.h"

#include <gtest/gtest.h>

#include <limits>
#include <string>

namespace velmora {
namespace {

using namespace std::chrono;

TEST(XMLReader, HoldsToItsLimits) {
    const auto reasonWith = [](const std::string& text, const PropertyListLimits& limits) {
        const auto value = readText(text, limits);
        return value ? "read" : value.reason();
    };
    const std::string nested = "<array><dict><key>k</key><array/></dict></array>";
    EXPECT_EQ(reasonWith(nested, {.maximumDepth = 3}), "read");
    EXPECT_EQ(reasonWith(nested, {.maximumDepth = 2}), "offset 25: <array> is nested deeper than 2");
    EXPECT_EQ(reasonWith(nested, {.maximumObjects = 4}), "read");
    EXPECT_EQ(reasonWith(nested, {.maximumObjects = 3}),
              "the list has more than 3 objects, repeated ones counted");
    EXPECT_EQ(reasonWith(nested, {.maximumObjects = std::numeric_limits<std::size_t>::max()}), "read");
    EXPECT_EQ(reasonWith("<true/>", {.maximumBytes = 7}), "read");
    EXPECT_EQ(reasonWith("<true/>", {.maximumBytes = 6}), "the list has 7 bytes, more than 6");
    EXPECT_EQ(reasonWith("<string>x</string>", {.maximumDepth = 0}), "read");
}

TEST(XMLReader, RefusesAMillionNestedArrays) {
    std::string text;
    for (int i = 0; i < 1'000'000; ++i)
        text += "<array>";
    const auto open = readText(text);
    ASSERT_FALSE(open);
    for (int i = 0; i < 1'000'000; ++i)
        text += "</array>";
    const auto closed = readText(text, {.maximumObjects = 1'000'000});
    ASSERT_FALSE(closed);
    EXPECT_EQ(closed.reason(), "offset 896: <array> is nested deeper than 128");
}

TEST(XMLReader, BoundsWhatADocumentOfTagsTakes) {
    // Some 60 bytes of memory for every 4 of input, and attributes are no cheaper: more than the objects
    // need.
    std::string tags = "<string>";
    for (int i = 0; i < 20'000; ++i)
        tags += "<a/>";
    std::string attributes = "<string";
    for (int i = 0; i < 20'000; ++i)
        attributes += " a=''";
    for (const std::string& text : {tags + "</string>", attributes + "/>"}) {
        const auto value = readText(text, {.maximumObjects = 100});
        ASSERT_FALSE(value);
        EXPECT_EQ(value.reason(), "the list has more tags and attributes than 100 objects need");
    }
}

TEST(XMLReader, AMessageMakesAtMostAHundredThousandValues) {
    const auto arrayOfBooleans = [](int count) {
        std::string text = "<array>";
        for (int i = 0; i < count; ++i)
            text += "<true/>";
        return text + "</array>";
    };
    EXPECT_TRUE(readText(arrayOfBooleans(99'999), messageLimits));
    const auto refused = readText(arrayOfBooleans(100'000), messageLimits);
    ASSERT_FALSE(refused);
    EXPECT_EQ(refused.reason(), "the list has more than 100000 objects, repeated ones counted");
}

TEST(XMLReader, CountsTextAndDataAndKeysTwice) {
    // Two values and a key of 256 bytes each; the text has 100, the key 3 bytes twice.
    const std::string text = "<dict><key>key</key><string>" + std::string(100, 'x') + "</string></dict>";
    EXPECT_TRUE(readText(text, {.maximumMemory = 874}));
    const auto refused = readText(text, {.maximumMemory = 873});
    ASSERT_FALSE(refused);
    EXPECT_EQ(refused.reason(),
              "the list takes more than 873 bytes of memory, repeated text and data counted");
    // Four digits are three bytes.
    const std::string data = "<data>" + std::string(400, 'A') + "</data>";
    EXPECT_TRUE(readText(data, {.maximumMemory = 556}));
    EXPECT_FALSE(readText(data, {.maximumMemory = 555}));
}

TEST(XMLReader, GivesAReasonOrAValueForEveryTruncationAndEveryChangedByte) {
    const auto xml = writeXMLPropertyList(
        arrayOf({"a & b", 12, 1.5, true, Date(), dataOf({1, 2}), dictionaryOf({{"k", makeArray()}})}));
    ASSERT_TRUE(xml) << xml.reason();
    for (std::size_t size = 0; size + 1 < xml->size(); ++size) {
        const auto value = readText(std::string_view(*xml).substr(0, size));
        ASSERT_FALSE(value) << size;
        EXPECT_FALSE(value.reason().empty());
    }
    for (std::size_t i = 0; i < xml->size(); ++i)
        for (const int flipped : {0x01, 0x02, 0x20, 0x80, 0xFF}) {
            std::string damaged = *xml;
            damaged[i] = static_cast<char>(damaged[i] ^ flipped);
            const auto value = readText(damaged);
            if (!value) {
                EXPECT_FALSE(value.reason().empty());
            }
        }
}

} // namespace
} // namespace velmora
