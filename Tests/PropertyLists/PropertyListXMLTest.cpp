// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/PropertyList.h"
#include "Tests/PropertyLists/XMLPropertyListText.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <string>

namespace velmora {
namespace {

using namespace std::chrono;

struct Good {
    std::string name;
    std::string text;
    Value value;
};

class XMLGood : public testing::TestWithParam<Good> {};

TEST_P(XMLGood, IsRead) {
    const auto value = readText(GetParam().text);
    ASSERT_TRUE(value) << value.reason();
    EXPECT_EQ(*value, GetParam().value);
}

const Good goodScalars[] = {
    {"String", plist("<string>abc</string>"), "abc"},
    {"EmptyString", plist("<string></string>"), ""},
    {"EmptyStringShort", plist("<string/>"), ""},
    {"WhiteSpaceString", plist("<string> \n\t </string>"), " \n\t "},
    {"EntitiesAndReferences", plist("<string>&lt;&gt;&amp;&quot;&apos;&#65;&#x42;&#x1F4F6;</string>"),
     "<>&\"'AB\xF0\x9F\x93\xB6"},
    {"ReferencesToWhiteSpace", plist("<string>&#9;&#10;&#13;</string>"), "\t\n\r"},
    {"EntitiesAreReplacedOnce", plist("<string>&amp;lt;</string>"), "&lt;"},
    {"LineEndsAreOne", plist("<string>a\r\nb\rc&#13;\nd</string>"), "a\nb\nc\r\nd"},
    {"Section", plist("<string><![CDATA[<a>&amp;]]></string>"), "<a>&amp;"},
    {"PiecesAndComments", plist("<string> <!-- one -->a<![CDATA[ b ]]> <!-- two --> <![CDATA[]]>c</string>"),
     " a b   c"},
    {"WhiteSpaceAroundASection", plist("<string> <![CDATA[x]]> </string>"), " x "},
    {"InstructionInAString", plist("<string>a<?note this?>b</string>"), "ab"},
    {"Integer", plist("<integer>42</integer>"), 42},
    {"IntegerWithSigns", plist("<array><integer>-7</integer><integer>+7</integer></array>"),
     arrayOf({-7, 7})},
    {"IntegerInSpace", plist("<integer>\n 12 </integer>"), 12},
    {"IntegerLimits",
     plist("<array><integer>9223372036854775807</integer>"
           "<integer>-9223372036854775808</integer></array>"),
     arrayOf({std::numeric_limits<std::int64_t>::max(), std::numeric_limits<std::int64_t>::min()})},
    {"IntegerHexadecimal", plist("<array><integer>0xFf</integer><integer>-0X10</integer></array>"),
     arrayOf({255, -16})},
    {"IntegerLeadingZeros", plist("<integer>007</integer>"), 7},
    {"Real", plist("<real>-1.5e3</real>"), -1500.0},
    {"RealWithoutPoint", plist("<real> +3 </real>"), 3.0},
    {"RealPointFirst", plist("<real>.25</real>"), 0.25},
    {"RealInfinities",
     plist("<array><real>infinity</real><real>+infinity</real><real>-infinity</real>"
           "<real>inf</real><real>-inf</real></array>"),
     arrayOf({INFINITY, INFINITY, -INFINITY, INFINITY, -INFINITY})},
    {"Booleans", plist("<array><true/><false/><true></true><false> </false></array>"),
     arrayOf({true, false, true, false})},
    {"Date", plist("<date>2026-11-16T05:00:00Z</date>"), Date(sys_days{year{2026} / 11 / 16} + 5h)},
    {"DateLeapDay", plist("<date>2000-02-29T23:59:59Z</date>"),
     Date(sys_days{year{2000} / 2 / 29} + 23h + 59min + 59s)},
    {"DateFirst", plist("<date>0001-01-01T00:00:00Z</date>"), Date(sys_days{year{1} / 1 / 1})},
    {"Data", plist("<data>AAEC/+8=</data>"), dataOf({0, 1, 2, 0xFF, 0xEF})},
    {"DataInLines", plist("<data>\n\tAA\n\tEC /w = =\n</data>"), dataOf({0, 1, 2, 0xFF})},
    {"DataEmpty", plist("<data> </data>"), Data()},
};
INSTANTIATE_TEST_SUITE_P(Scalars, XMLGood, testing::ValuesIn(goodScalars),
                         [](const auto& parameter) { return parameter.param.name; });

const Good goodDocuments[] = {
    {"WholeHead",
     "\xEF\xBB\xBF<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<!DOCTYPE plist SYSTEM \"x\" [<!ENTITY e "
     "\"v\">]>\n"
     "<!-- c --><plist>\n <!-- c --><string>a</string> </plist>\n<!-- c -->\n",
     "a"},
    {"BareValue", "<array><string>a</string></array>", arrayOf({"a"})},
    {"Attributes", plist("<dict a=\"1\"><key b='&amp;'>k</key><string c=\"\">v</string></dict>"),
     dictionaryOf({{"k", "v"}})},
    {"EmptyContainers", plist("<array><array/><dict/><array> </array><dict></dict></array>"),
     arrayOf({makeArray(), makeDictionary(), makeArray(), makeDictionary()})},
    {"EmptyKey", plist("<dict><key/><string>v</string></dict>"), dictionaryOf({{"", "v"}})},
    {"KeyKeepsItsSpace", plist("<dict><key> k\n</key><true/></dict>"), dictionaryOf({{" k\n", true}})},
};
INSTANTIATE_TEST_SUITE_P(Documents, XMLGood, testing::ValuesIn(goodDocuments),
                         [](const auto& parameter) { return parameter.param.name; });

TEST(XMLReader, ReadsNotANumber) {
    const auto value = readText("<real>nan</real>");
    ASSERT_TRUE(value) << value.reason();
    ASSERT_TRUE(value->asReal());
    EXPECT_TRUE(std::isnan(*value->asReal()));
}

TEST(XMLReader, KeepsTheOrderOfKeysAndTheLastOfTwoValues) {
    const auto value = readText("<dict><key>b</key><integer>1</integer><key>a</key><integer>2</integer>"
                                "<key>b</key><integer>3</integer></dict>");
    ASSERT_TRUE(value) << value.reason();
    const Dictionary& dictionary = *value->asDictionary();
    ASSERT_EQ(dictionary.size(), 2U);
    EXPECT_EQ(dictionary.begin()->key, "b");
    EXPECT_EQ(dictionary["b"], Value(3));
    EXPECT_EQ(dictionary["a"], Value(2));
}

struct Bad {
    std::string name;
    std::string text;
    std::string reason;
};

class XMLBad : public testing::TestWithParam<Bad> {};

TEST_P(XMLBad, IsRefusedWithAReason) {
    const auto value = readText(GetParam().text);
    ASSERT_FALSE(value);
    EXPECT_EQ(value.reason(), GetParam().reason);
}

const Bad badInputs[] = {
    {"Nothing", "", "the list has no element"},
    {"OnlySpace", " \n ", "the list has no element"},
    {"OnlyText", "hello", "offset 0: text \"hello\" where an element was wanted"},
    {"OneLetter", "x", "offset 0: text \"x\" where an element was wanted"},
    {"NoValue", "<plist> </plist>", "offset 0: <plist> holds no value"},
    {"TwoValues", "<plist><true/><false/></plist>", "offset 14: a second value in <plist>"},
    {"TwoRoots", "<true/><false/>", "offset 7: a second root element <false>"},
    {"TextBehindTheRoot", "<true/> x", "offset 7: text \" x\" where an element was wanted"},
    {"TextInThePlist", "<plist>x<true/></plist>", "offset 7: text \"x\" where an element was wanted"},
    {"SectionInThePlist", "<plist><![CDATA[x]]><true/></plist>",
     "offset 16: text \"x\" where an element was wanted"},
    {"TextInAnArray", "<array><true/>x</array>", "offset 14: text \"x\" where an element was wanted"},
    {"SectionInAnArray", "<array><true/><![CDATA[x]]></array>",
     "offset 23: text \"x\" where an element was wanted"},
    {"TextBeforeAKey", "<dict>x<key>k</key><true/></dict>",
     "offset 6: text \"x\" where an element was wanted"},
    {"TextBehindAKey", "<dict><key>k</key>x<true/></dict>",
     "offset 18: text \"x\" where an element was wanted"},
    {"UnknownElement", "<array><text>x</text></array>", "offset 7: <text> where a value was wanted"},
    {"ElementNamesHaveACase", "<String>x</String>", "offset 0: <String> where a value was wanted"},
    {"KeyAsAValue", "<array><key>x</key></array>", "offset 7: <key> where a value was wanted"},
    {"PlistAsAValue", "<plist><plist><true/></plist></plist>", "offset 7: <plist> where a value was wanted"},
    {"KeyWithoutValue", "<dict><key>k</key></dict>", "offset 6: the key \"k\" has no value"},
    {"KeyBehindKey", "<dict><key>k</key><key>l</key></dict>", "offset 18: <key> where a value was wanted"},
    {"ValueWithoutKey", "<dict><true/></dict>", "offset 6: <true> where a <key> was wanted"},
    {"ElementInAString", "<string>a<b/></string>", "offset 9: <b> inside <string>"},
    {"ElementInAKey", "<dict><key><b/></key><true/></dict>", "offset 11: <b> inside <key>"},
    {"BooleanWithText", "<true>x</true>", "offset 0: <true> holds \"x\", not nothing"},
    {"IntegerEmpty", "<integer/>", "offset 0: <integer> holds \"\", not an integer"},
    {"IntegerWithLetters", "<integer>12x</integer>", "offset 0: <integer> holds \"12x\", not an integer"},
    {"IntegerWithTwoSigns", "<integer>+-1</integer>", "offset 0: <integer> holds \"+-1\", not an integer"},
    {"IntegerOnlyPrefix", "<integer>0x</integer>", "offset 0: <integer> holds \"0x\", not an integer"},
    {"IntegerTooLarge", "<integer>9223372036854775808</integer>",
     "offset 0: <integer> holds \"9223372036854775808\", not a number of 64 bits"},
    {"IntegerTooSmall", "<integer>-9223372036854775809</integer>",
     "offset 0: <integer> holds \"-9223372036854775809\", not a number of 64 bits"},
    {"IntegerFarTooLarge", "<integer>0x10000000000000000</integer>",
     "offset 0: <integer> holds \"0x10000000000000000\", not a number of 64 bits"},
    {"RealEmpty", "<real> </real>", "offset 0: <real> holds \" \", not a real"},
    {"RealWithLetters", "<real>1.5dBm</real>", "offset 0: <real> holds \"1.5dBm\", not a real"},
    {"RealNanWithMore", "<real>nan(1)</real>", "offset 0: <real> holds \"nan(1)\", not a real"},
    {"RealTooLarge", "<real>1e999</real>", "offset 0: <real> holds \"1e999\", not a real"},
    {"DateWithoutZone", "<date>2026-11-16T05:00:00</date>",
     "offset 0: <date> holds \"2026-11-16T05:00:00\", not a date like 2026-11-16T05:00:00Z"},
    {"DateInSpace", "<date> 2026-11-16T05:00:00Z</date>",
     "offset 0: <date> holds \" 2026-11-16T05:00:00Z\", not a date like 2026-11-16T05:00:00Z"},
    {"DateOfNoCalendar", "<date>2026-02-29T05:00:00Z</date>",
     "offset 0: <date> holds \"2026-02-29T05:00:00Z\", not a date like 2026-11-16T05:00:00Z"},
    {"DateHour24", "<date>2026-02-28T24:00:00Z</date>",
     "offset 0: <date> holds \"2026-02-28T24:00:00Z\", not a date like 2026-11-16T05:00:00Z"},
    {"DateMinute60", "<date>2026-02-28T23:60:00Z</date>",
     "offset 0: <date> holds \"2026-02-28T23:60:00Z\", not a date like 2026-11-16T05:00:00Z"},
    {"DateSecond60", "<date>2016-12-31T23:59:60Z</date>",
     "offset 0: <date> holds \"2016-12-31T23:59:60Z\", not a date like 2026-11-16T05:00:00Z"},
    {"DateYearZero", "<date>0000-01-01T00:00:00Z</date>",
     "offset 0: <date> holds \"0000-01-01T00:00:00Z\", not a date like 2026-11-16T05:00:00Z"},
    {"DataNotPadded", "<data>AAE</data>", "offset 0: <data> holds \"AAE\", not base64"},
    {"DataPaddedTooMuch", "<data>AAE==</data>", "offset 0: <data> holds \"AAE==\", not base64"},
    {"DataPaddedInside", "<data>AA==AAAA</data>", "offset 0: <data> holds \"AA==AAAA\", not base64"},
    {"DataOneDigit", "<data>A===</data>", "offset 0: <data> holds \"A===\", not base64"},
    {"DataOnlyPadding", "<data>====</data>", "offset 0: <data> holds \"====\", not base64"},
    {"DataOtherCharacters", "<data>AA-_</data>", "offset 0: <data> holds \"AA-_\", not base64"},
    {"LongTextIsShortened", "<integer>" + std::string(50, 'y') + "</integer>",
     "offset 0: <integer> holds \"" + std::string(40, 'y') + "...\", not an integer"},
    {"LongTextIsCutBetweenCharacters", "<integer>" + std::string(39, 'y') + "\xE2\x82\xAC</integer>",
     "offset 0: <integer> holds \"" + std::string(39, 'y') + "...\", not an integer"},
    {"UnknownEntity", "<!DOCTYPE plist [<!ENTITY lol \"x\">]><string>a&lol;</string>",
     "offset 44: the text here has the unknown reference \"&lol;\""},
    {"BareAmpersand", "<string>a & b</string>", "offset 8: the text here has the unknown reference \"&\""},
    {"ReferenceToZero", "<string>&#0;</string>",
     "offset 8: the text here has the unknown reference \"&#0;\""},
    {"ReferenceToASurrogate", "<string>&#xD800;</string>",
     "offset 8: the text here has the unknown reference \"&#xD800;\""},
    {"ReferenceTooLarge", "<string>&#4294967361;</string>",
     "offset 8: the text here has the unknown reference \"&#4294967361;\""},
    {"ReferenceToANoncharacter", "<string>&#xFFFE;</string>",
     "offset 8: the text here has the unknown reference \"&#xFFFE;\""},
    {"ReferenceToTheOtherNoncharacter", "<string>&#xFFFF;</string>",
     "offset 8: the text here has the unknown reference \"&#xFFFF;\""},
    {"ReferenceWithLetters", "<string>&#65x;</string>",
     "offset 8: the text here has the unknown reference \"&#65x;\""},
    {"ReferenceBehindASection", "<string><![CDATA[a]]>&b;</string>",
     "offset 21: the text here has the unknown reference \"&b;\""},
    {"ReferenceEmpty", "<string>&#x;</string>", "offset 8: the text here has the unknown reference \"&#x;\""},
    {"ZeroByte", std::string("<string>a\0b</string>", 20), "offset 9: no character of XML in UTF-8"},
    {"ControlCharacter", "<string>\x01</string>", "offset 8: no character of XML in UTF-8"},
    {"NotUTF8", "<string>ab\xFF</string>", "offset 10: no character of XML in UTF-8"},
    {"UTF8TooLong", "<string>\xC0\x80</string>", "offset 8: no character of XML in UTF-8"},
    {"UTF8Surrogate", "<string>\xED\xA0\x80</string>", "offset 8: no character of XML in UTF-8"},
    {"UTF8Beyond", "<string>\xF4\x90\x80\x80</string>", "offset 8: no character of XML in UTF-8"},
    {"UTF8CutOff", "<string>\xE2\x82", "offset 8: no character of XML in UTF-8"},
    {"UTF16", std::string("\xFF\xFE<\0", 4), "offset 0: no character of XML in UTF-8"},
};
INSTANTIATE_TEST_SUITE_P(Inputs, XMLBad, testing::ValuesIn(badInputs),
                         [](const auto& parameter) { return parameter.param.name; });

TEST(XMLReader, DoesNotQuoteAMessage) {
    const std::string number = "8949027500001234568";
    const std::pair<std::string, std::string> inputs[] = {
        {number, "offset 0: text of 19 bytes where an element was wanted"},
        {"<dict>" + number + "</dict>", "offset 6: text of 19 bytes where an element was wanted"},
        {"<array><true/>" + number + "</array>", "offset 14: text of 19 bytes where an element was wanted"},
        {"<true/><n" + number + "/>", "offset 7: a second root element <...>"},
        {"<n" + number + "/>", "offset 0: <...> where a value was wanted"},
        {"<dict><n" + number + "/></dict>", "offset 6: <...> where a <key> was wanted"},
        {"<dict><key>" + number + "</key></dict>", "offset 6: the key of 19 bytes has no value"},
        {"<string><n" + number + "/></string>", "offset 8: <...> inside <string>"},
        {"<integer>n" + number + "</integer>", "offset 0: <integer> holds text of 20 bytes, not an integer"},
        {"<true>1</true>", "offset 0: <true> holds text of 1 byte, not nothing"},
        {"<string>&n" + number + ";</string>",
         "offset 8: the text here has the unknown reference of 22 bytes"},
    };
    for (const auto& [text, reason] : inputs) {
        const auto value = readText(text, messageLimits);
        ASSERT_FALSE(value) << text;
        EXPECT_EQ(value.reason(), reason);
    }
}

TEST(XMLReader, RefusesWhatIsNotWellFormedAndSaysWhere) {
    for (const char* text :
         {"<array>", "<array><string>x</array>", "<array></dict>", "<string>x</string", "<", "<!-- ",
          "<string a></string>", "<string><![CDATA[x</string>", "</array>", "<?xml"}) {
        const auto value = readText(text);
        ASSERT_FALSE(value) << text;
        EXPECT_TRUE(value.reason().starts_with("offset ")) << value.reason();
    }
    EXPECT_EQ(readText("<array></dict>").reason(), "offset 9: start-end tags mismatch");
}

} // namespace
} // namespace velmora
