// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/PropertyList.h"
#include "Tests/PropertyLists/PropertyListSamples.h"

#include <gtest/gtest.h>

#include <cmath>
#include <string>

namespace velmora {
namespace {

using namespace std::chrono;

TEST(XMLWriter, WritesTheFormThatOthersRead) {
    const auto xml = writeXMLPropertyList(dictionaryOf(
        {{"s<", "a&b\r"},
         {"list", arrayOf({-1, 0.1, INFINITY, -INFINITY, NAN, true, false, makeArray(), makeDictionary(),
                           Date(sys_days{year{2026} / 11 / 16} + 5h + 6min + 7s), dataOf({0xFF, 0xEF})})},
         {"d", dataOf(std::vector<std::uint8_t>(58, 0))}}));
    ASSERT_TRUE(xml) << xml.reason();
    EXPECT_EQ(*xml, "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                    "<plist version=\"1.0\">\n"
                    "<dict>\n"
                    "\t<key>s&lt;</key>\n"
                    "\t<string>a&amp;b&#13;</string>\n"
                    "\t<key>list</key>\n"
                    "\t<array>\n"
                    "\t\t<integer>-1</integer>\n"
                    "\t\t<real>0.1</real>\n"
                    "\t\t<real>+infinity</real>\n"
                    "\t\t<real>-infinity</real>\n"
                    "\t\t<real>nan</real>\n"
                    "\t\t<true/>\n"
                    "\t\t<false/>\n"
                    "\t\t<array/>\n"
                    "\t\t<dict/>\n"
                    "\t\t<date>2026-11-16T05:06:07Z</date>\n"
                    "\t\t<data>\n"
                    "\t\t/+8=\n"
                    "\t\t</data>\n"
                    "\t</array>\n"
                    "\t<key>d</key>\n"
                    "\t<data>\n"
                    "\t" +
                        std::string(76, 'A') +
                        "\n"
                        "\tAA==\n"
                        "\t</data>\n"
                        "</dict>\n"
                        "</plist>\n");
}

TEST(XMLWriter, RefusesWhatTheFormCannotCarry) {
    const auto reasonOf = [](const Value& value) {
        const auto xml = writeXMLPropertyList(value);
        return xml ? "written" : xml.reason();
    };
    EXPECT_EQ(reasonOf(Value()), "there is no value to write");
    EXPECT_EQ(reasonOf(arrayOf({Value()})), "there is no value to write");
    EXPECT_EQ(reasonOf(dictionaryOf({{"k", Value()}})), "there is no value to write");
    EXPECT_EQ(reasonOf("ab\x01"), "a string holds what XML cannot carry at its offset 2");
    EXPECT_EQ(reasonOf("a\xFF"), "a string holds what XML cannot carry at its offset 1");
    EXPECT_EQ(reasonOf("\xEF\xBF\xBF"), "a string holds what XML cannot carry at its offset 0");
    EXPECT_EQ(reasonOf(dictionaryOf({{std::string("\0", 1), 1}})),
              "a string holds what XML cannot carry at its offset 0");
    EXPECT_EQ(reasonOf(Date(sys_days{year{10000} / 1 / 1})), "a date lies outside the years 0001 to 9999");
    EXPECT_EQ(reasonOf(Date(sys_days{year{0} / 12 / 31})), "a date lies outside the years 0001 to 9999");
    EXPECT_EQ(reasonOf(nestedArrays(128)), "written");
    EXPECT_EQ(reasonOf(nestedArrays(129)), "the value is nested deeper than 128");
    Value dictionaries = dictionaryOf({});
    for (int depth = 1; depth < 128; ++depth)
        dictionaries = dictionaryOf({{"k", dictionaries}});
    EXPECT_EQ(reasonOf(dictionaries), "written");
    EXPECT_EQ(reasonOf(dictionaryOf({{"k", dictionaries}})), "the value is nested deeper than 128");

    const auto cycle = makeArray();
    cycle->append(cycle);
    EXPECT_EQ(reasonOf(cycle), "the value is nested deeper than 128");
    cycle->clear();
}

TEST(XMLRoundTrip, GivesTheSameValueAgain) {
    for (const Value& value :
         {everyKind(), manyEntries(), nestedArrays(128), Value("bare"), Value(makeArray())}) {
        const auto xml = writeXMLPropertyList(value);
        ASSERT_TRUE(xml) << xml.reason();
        const auto read = readPropertyList(bytesOf(*xml), largeLimits);
        ASSERT_TRUE(read) << read.reason();
        EXPECT_TRUE(*read == value);
    }
}

} // namespace
} // namespace velmora
