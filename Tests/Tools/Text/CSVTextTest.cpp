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

TEST(CSVTextTest, GuardedTextsAreNoFormulas) {
    struct Case {
        const char* text;
        const char* cell;
    };
    const Case cases[] = {
        {"=1+1", "'=1+1"},
        {"+HYPERLINK", "'+HYPERLINK"},
        {"-71 dBm", "'-71 dBm"},
        {"-", "'-"},
        {"--1", "'--1"},
        {"-inf", "'-inf"},
        {"-0x10", "'-0x10"},
        {"+1 2", "'+1 2"},
        {"@SUM(A1)", "'@SUM(A1)"},
        {"=a,b", "\"'=a,b\""},
        {"=\"a\"", "\"'=\"\"a\"\"\""},
        {"\t=1", "\"'\t=1\""},
        {"\r=1", "\"'\r=1\""},
        {"\n=1", "\"'\n=1\""},
        {"-71", "-71"},
        {"+5", "+5"},
        {"-.5e-3", "-.5e-3"},
        {"-1e999", "-1e999"}, // out of range, but written as a number
        {"a=b", "a=b"},
        {"'=1", "'=1"},
        {"", "\"\""},
    };
    for (const Case& row : cases) {
        TextBuffer out;
        appendCsvText(out, row.text, CSVGuard::On);
        EXPECT_EQ(out.view(), row.cell);
    }
    TextBuffer out;
    const Value formula("=1+1");
    appendCsvCell(out, &formula, CSVGuard::On);
    out.append(' ');
    appendCsvCell(out, &formula);
    EXPECT_EQ(out.view(), "'=1+1 =1+1");
}

} // namespace
} // namespace velmora
