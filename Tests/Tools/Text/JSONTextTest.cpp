// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Text/JSONText.h"

#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include <chrono>
#include <limits>
#include <string>

namespace velmora {
namespace {

std::string jsonText(const Value& value, int level = 0) {
    TextBuffer out;
    appendIndentedJson(out, value, level);
    return std::string(out.view());
}

std::string jsonString(std::string_view text) {
    TextBuffer out;
    appendJsonString(out, text);
    return std::string(out.view());
}

TEST(JSONTextTest, EveryKindHasItsForm) {
    using namespace std::chrono;
    struct Case {
        Value value;
        const char* text;
    };
    const Case cases[] = {
        {Value(), "null"},
        {"text", "\"text\""},
        {"", "\"\""},
        {-7, "-7"},
        {std::numeric_limits<std::int64_t>::max(), "9223372036854775807"},
        {0.25, "0.25"},
        {3.0, "3.0"},
        {std::numeric_limits<double>::quiet_NaN(), "null"},
        {std::numeric_limits<double>::infinity(), "null"},
        {1e22, "1e+22"},
        {-0.1, "-0.1"},
        {true, "true"},
        {false, "false"},
        {Date(sys_days{year{2026} / November / 16} + hours{5} + seconds{9}), "\"2026-11-16T05:00:09Z\""},
        {Date(sys_days{year{9999} / December / 31}), "\"9999-12-31T00:00:00Z\""}, // no Time reaches it
        {hex(""), "\"\""},
        {hex("4D"), "\"TQ==\""},
        {hex("4D 61"), "\"TWE=\""},
        {hex("4D 61 6E"), "\"TWFu\""},
        {hex("FB FF FE"), "\"+//+\""},
        {makeArray(), "[]"},
        {makeDictionary(), "{}"},
    };
    for (const Case& row : cases)
        EXPECT_EQ(jsonText(row.value), row.text);
}

TEST(JSONTextTest, CharactersThatWouldDisturbATerminalAreEscaped) {
    const std::string text = "\u009B2J\u202E\u061C\uFEFF\U000E0041\U000E0001 \u1719\u00FC\u0301\U0001F4E1";
    const std::string json = jsonString(text);
    EXPECT_EQ(json,
              "\"\\u009b2J\\u202e\\u061c\\ufeff\\udb40\\udc41\\udb40\\udc01 \u1719\u00FC\u0301\U0001F4E1\"");
    EXPECT_EQ(nlohmann::json::parse(json).get<std::string>(), text);
}

TEST(JSONTextTest, ContainersAreIndentedAndKeepTheirOrder) {
    const ArrayRef rows = std::make_shared<Array>(std::initializer_list<Value>{"first", 2, makeArray()});
    const DictionaryRef display = makeDictionary();
    display->set("_sorted", true);
    display->set("b", rows);
    display->set("a", makeDictionary());
    EXPECT_EQ(jsonText(display), R"({
  "_sorted": true,
  "b": [
    "first",
    2,
    []
  ],
  "a": {}
})");
    EXPECT_EQ(jsonText(rows, 2), "[\n      \"first\",\n      2,\n      []\n    ]");
}

TEST(JSONTextTest, OneLineHasNoBlanks) {
    const ArrayRef rows =
        std::make_shared<Array>(std::initializer_list<Value>{"first row", Value(), makeArray()});
    const DictionaryRef display = makeDictionary();
    display->set("b", rows);
    display->set("a", makeDictionary());
    TextBuffer out;
    out.append("before ");
    appendJson(out, display);
    EXPECT_EQ(out.view(), R"(before {"b":["first row",null,[]],"a":{}})");
}

TEST(JSONTextTest, StringsAreValidForAnyContent) {
    EXPECT_EQ(jsonString("quote \" backslash \\ feed \n bell \x07"),
              R"("quote \" backslash \\ feed \n bell \u0007")");
    EXPECT_EQ(jsonString("\b\f\r\t\x1F\x7F"), "\"\\b\\f\\r\\t\\u001f\x7F\"");
    EXPECT_EQ(jsonString(std::string_view("\0", 1)), R"("\u0000")");
    EXPECT_EQ(jsonString("gr\xC3\xBC\xC3\x9F"), "\"gr\xC3\xBC\xC3\x9F\"");
    // A byte of no character, a character that is cut off, and a surrogate, each byte of which is none.
    EXPECT_EQ(jsonString("a\xFF"
                         "b"),
              "\"a\xEF\xBF\xBD"
              "b\"");
    EXPECT_EQ(jsonString("\xC3"), "\"\xEF\xBF\xBD\"");
    EXPECT_EQ(jsonString("\xED\xA0\x80"), "\"\xEF\xBF\xBD\xEF\xBF\xBD\xEF\xBF\xBD\"");
}

TEST(JSONTextTest, EveryByteIsFoundAtAnyOffset) {
    // Texts are looked at in words of eight bytes: every place in a text of up to three words, every byte.
    for (std::size_t length = 1; length <= 24; ++length) {
        for (std::size_t place = 0; place < length; ++place) {
            for (int byte = 0; byte < 256; ++byte) {
                std::string text(length, '~');
                text[place] = static_cast<char>(byte);
                std::string shown = text.substr(place, 1);
                if (byte == '"' || byte == '\\')
                    shown.insert(0, 1, '\\');
                else if (byte >= 0x80)
                    shown = "\xEF\xBF\xBD";
                else if (byte < 0x20)
                    shown.clear(); // its escape is any that reads back as the byte
                const std::string json = jsonString(text);
                if (byte < 0x20)
                    ASSERT_EQ(nlohmann::json::parse(json).get<std::string>(), text);
                else
                    ASSERT_EQ(json, "\"" + text.substr(0, place) + shown + text.substr(place + 1) + "\"");
            }
        }
    }
}

TEST(JSONTextTest, BufferKeepsWhatItHasWhenItGrows) {
    TextBuffer out;
    std::string expected;
    for (int i = 0; i < 5000; ++i) {
        const std::string text = "row " + std::to_string(i);
        appendJsonString(out, text);
        expected += '"' + text + '"';
    }
    EXPECT_EQ(out.view(), expected);
    out.truncate(7);
    EXPECT_EQ(out.view(), "\"row 0\"");
    out.clear();
    EXPECT_EQ(out.view(), "");
}

} // namespace
} // namespace velmora
