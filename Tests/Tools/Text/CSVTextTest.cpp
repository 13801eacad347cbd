// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Text/CSVText.h"

#include <gtest/gtest.h>

#include <string>

namespace velmora {
namespace {

std::string cell(const Value& value) {
    TextBuffer out;
    appendCsvCell(out, &value);
    return std::string(out.view());
}

TEST(CSVTextTest, CellsAreValidForAnyContent) {
    using namespace std::string_literals;
    struct Case {
        Value value;
        std::string cell;
    };
    const Case cases[] = {
        {"-71 dBm", "-71 dBm"},
        {" blanks ", " blanks "},
        {"", "\"\""}, // empty, which is not absent
        {"a,b", "\"a,b\""},
        {"say \"a\"", "\"say \"\"a\"\"\""},
        {"two\r\nlines", "\"two\r\nlines\""},
        {"two\nlines", "\"two\nlines\""},
        {"a\tb", "\"a\tb\""},
        {"100 \xC3\x97 64", "\"100 \xC3\x97 64\""},
        {"a\xFF,", "\"a\xEF\xBF\xBD,\""},
        {"a\0b"s, "\"a\xEF\xBF\xBD"
                  "b\""},
        {Value(), ""},
        {7, "7"},
        {std::make_shared<Array>(std::initializer_list<Value>{"a", "b"}), R"("[""a"",""b""]")"},
        {makeDictionary(), "{}"},
    };
    for (const Case& row : cases)
        EXPECT_EQ(cell(row.value), row.cell);
    TextBuffer out;
    appendCsvCell(out, nullptr);
    EXPECT_EQ(out.view(), "");
}

} // namespace
} // namespace velmora
