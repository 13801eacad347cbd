// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Data/ListScalars.h"
#include "PropertyLists/PropertyList.h"

#include <gtest/gtest.h>

#include <string>
#include <string_view>

namespace velmora {
namespace {

Bytes bytesOf(std::string_view text) {
    return {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()};
}

/// "old>new" of each scalar, after another.
std::string changes(Bytes list, std::size_t most = 100) {
    std::string text;
    for (const ChangedBytes& each : listScalars(list, most))
        text += (text.empty() ? "" : " ") +
                std::string(list.begin() + static_cast<std::ptrdiff_t>(each.begin),
                            list.begin() + static_cast<std::ptrdiff_t>(each.end)) +
                ">" + std::string(each.others.begin(), each.others.end());
    return text;
}

TEST(ListScalarsTest, XMLScalarsGetAnotherValueOfTheirKind) {
    EXPECT_EQ(changes(bytesOf("<integer>-71</integer>")), "-71>-70");
    EXPECT_EQ(changes(bytesOf("<real>0.5</real>")), "0.5>0.4");
    EXPECT_EQ(changes(bytesOf("<string>LAC z</string>")), "LAC z>LAC y");
    EXPECT_EQ(changes(bytesOf("<string>42 %</string>")), "42 %>43 %");
    EXPECT_EQ(changes(bytesOf("<date>2026-11-22T05:00:00Z</date>")),
              "2026-11-22T05:00:00Z>2026-11-22T05:00:01Z");
    EXPECT_EQ(changes(bytesOf("<data>\n\tAQ==\n</data>")), "\n\tAQ==\n>\n\tBQ==\n");
    EXPECT_EQ(changes(bytesOf("<true/>")), "<true/>><false/>");
    EXPECT_EQ(changes(bytesOf("<false />")), "<false />><true/>");
}

TEST(ListScalarsTest, WhatIsNoScalarIsLeftOut) {
    EXPECT_EQ(changes(bytesOf("<plist><dict><key>A1</key><integer>1</integer>"
                              "<!-- <integer>2</integer> --><key/><string/><string></string>"
                              "<array><string>b</string></array></dict></plist>")),
              "1>0 b>c");
    EXPECT_EQ(changes(bytesOf("")), "");
    EXPECT_EQ(changes(bytesOf("<integer>1")), "");
    EXPECT_EQ(changes(bytesOf("<!-- <integer>1</integer>")), "");
    EXPECT_EQ(changes(bytesOf("<string>1</string><string>2</string>"), 1), "") << "more than the limit";
}

TEST(ListScalarsTest, BinaryScalarsGetAnotherValueOfTheirKind) {
    const DictionaryRef root = makeDictionary();
    root->set("key1", Value(std::int64_t{300}));
    root->set("key2", "cell 8");
    root->set("key3", Value(true));
    root->set("key4", Value(-85.5));
    root->set("key5", "caf\u00e9");
    const auto written = writeBinaryPropertyList(Value(root));
    ASSERT_TRUE(written);
    std::vector<std::string> kept = {"300", "cell 8", "true", "-85.5", "caf\u00e9"};
    const std::vector<ChangedBytes> scalars = listScalars(*written, 100);
    ASSERT_EQ(scalars.size(), kept.size());
    // Each change is read as another value under one key, and all others as they were.
    for (const ChangedBytes& each : scalars) {
        std::vector<std::uint8_t> changed = *written;
        ASSERT_EQ(each.others.size(), each.end - each.begin);
        std::copy(each.others.begin(), each.others.end(),
                  changed.begin() + static_cast<std::ptrdiff_t>(each.begin));
        const Result<Value> read = readPropertyList(changed);
        ASSERT_TRUE(read);
        const Dictionary& dictionary = *read->asDictionary();
        int others = 0;
        for (const auto& [key, value] : *root)
            others += dictionary[key] == value ? 0 : 1;
        EXPECT_EQ(others, 1);
        EXPECT_EQ(dictionary.size(), root->size());
    }
}

TEST(ListScalarsTest, EveryBeginningOfAListIsSafe) {
    const DictionaryRef root = makeDictionary();
    root->set("key1", "text");
    root->set("key2", Value(std::int64_t{70000}));
    const auto binary = writeBinaryPropertyList(Value(root));
    const auto xml = writeXMLPropertyList(Value(root));
    ASSERT_TRUE(binary && xml);
    for (std::size_t i = 0; i <= binary->size(); ++i)
        for (const ChangedBytes& each : listScalars(Bytes(*binary).first(i), 100))
            EXPECT_LE(each.end, i);
    for (std::size_t i = 0; i <= xml->size(); ++i)
        for (const ChangedBytes& each : listScalars(bytesOf(*xml).first(i), 100))
            EXPECT_LE(each.end, i);
}

} // namespace
} // namespace velmora
