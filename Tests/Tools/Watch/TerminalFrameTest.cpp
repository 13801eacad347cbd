// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Watch/TerminalFrame.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

/// "row 0", "row 1", ...
std::vector<TreeRow> rowsOf(std::size_t count) {
    std::vector<TreeRow> rows;
    for (std::size_t i = 0; i < count; ++i)
        rows.push_back({"row " + std::to_string(i), false});
    return rows;
}

TEST(TerminalFrameTest, RowsAreAboveTheStatusLine) {
    const std::vector<TreeRow> rows = {{"Cell", true}, {"  ARFCN  33", false}};
    EXPECT_EQ(composeFrame(rows, "Connecting...", {20, 4}, 0), "\x1b[H"
                                                               "\x1b[1mCell\x1b[0m\x1b[K\r\n"
                                                               "  ARFCN  33\x1b[K\r\n"
                                                               "\x1b[K\r\n"
                                                               "\x1b[7mConnecting...       \x1b[0m");
}

TEST(TerminalFrameTest, WithoutRowsTheScreenIsBlankAboveTheStatusLine) {
    EXPECT_EQ(composeFrame({}, "ab", {4, 2}, 7), "\x1b[H\x1b[K\r\n\x1b[7mab  \x1b[0m");
}

TEST(TerminalFrameTest, LongRowsAndStatusAreCutAtTheWindow) {
    // A full line is not cleared past its end: that would take its last character.
    EXPECT_EQ(composeFrame({{"0123456789", false}, {"01234567", false}}, "0123456789", {8, 3}, 0),
              "\x1b[H"
              "0123456…\r\n"
              "01234567\r\n"
              "\x1b[7m0123456…\x1b[0m");
}

TEST(TerminalFrameTest, ScrolledScreenShowsItsPosition) {
    EXPECT_EQ(composeFrame(rowsOf(10), "ok", {12, 4}, 5), "\x1b[H"
                                                          "row 5\x1b[K\r\n"
                                                          "row 6\x1b[K\r\n"
                                                          "row 7\x1b[K\r\n"
                                                          "\x1b[7mok    6-8/10\x1b[0m");
}

TEST(TerminalFrameTest, ScrollPastTheEndShowsTheLastRows) {
    EXPECT_EQ(composeFrame(rowsOf(5), "s", {12, 4}, 99), composeFrame(rowsOf(5), "s", {12, 4}, 2));
}

TEST(TerminalFrameTest, WideWindowShowsSeveralColumns) {
    // Rows of five columns count as eight: 8 + 3 + 8 is the least width for two.
    EXPECT_EQ(composeFrame(rowsOf(5), "s", {19, 4}, 0), "\x1b[H"
                                                        "row 0      row 3\x1b[K\r\n"
                                                        "row 1      row 4\x1b[K\r\n"
                                                        "row 2\x1b[K\r\n"
                                                        "\x1b[7ms                  \x1b[0m");
    EXPECT_EQ(layoutOf(rowsOf(5), {18, 4}).columns, 1U);
    EXPECT_EQ(layoutOf(rowsOf(5), {200, 4}).columns, 2U); // no more than the rows need
    EXPECT_EQ(layoutOf(rowsOf(3), {200, 4}).columns, 1U);
}

TEST(TerminalFrameTest, WindowOfOneRowHasTheStatusAlone) {
    EXPECT_EQ(composeFrame(rowsOf(5), "s", {3, 1}, 0), "\x1b[H\x1b[7ms  \x1b[0m");
}

TEST(TerminalFrameTest, KeysScrollWithinTheRows) {
    const ScreenLayout layout = layoutOf(rowsOf(10), {12, 4}); // pages of three
    struct Case {
        Key key;
        std::size_t from;
        std::size_t to;
    };
    const Case cases[] = {
        {Key::Up, 0, 0},     {Key::Up, 4, 3},     {Key::Down, 4, 5},     {Key::Down, 7, 7},
        {Key::PageUp, 2, 0}, {Key::PageUp, 5, 2}, {Key::PageDown, 1, 4}, {Key::PageDown, 5, 7},
        {Key::Home, 5, 0},   {Key::End, 1, 7},    {Key::Escape, 3, 3},   {Key::Up, 99, 6},
    };
    for (const Case& row : cases)
        EXPECT_EQ(scrolledBy(row.key, row.from, layout), row.to);
}

TEST(AdviceRowsTest, BreaksAtBlanks) {
    const auto texts = [](std::string_view text, std::size_t columns) {
        std::vector<std::string> rows;
        for (const TreeRow& row : adviceRows(text, columns))
            rows.push_back(row.text);
        return rows;
    };
    using Rows = std::vector<std::string>;
    EXPECT_EQ(texts("start one with it", 9), (Rows{"start one", "with it"}));
    EXPECT_EQ(texts("start one with it", 8), (Rows{"start", "one with", "it"}));
    EXPECT_EQ(texts("start one", 80), (Rows{"start one"}));
    EXPECT_EQ(texts("longword", 3), (Rows{"lon", "gwo", "rd"}));
    EXPECT_EQ(texts("", 3), Rows());
}

} // namespace
} // namespace velmora
