// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Screen/BrowseScreen.h"

#include "Platform/PrintableText.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace velmora {
namespace {

/// A message of which one field is chosen, with names that are wider than they are long.
BrowseView exampleView() {
    BrowseView view;
    view.title = "drive.pcapng";
    view.place = "message 2 of 2 ";
    MessageRow row;
    row.code = 0x5134;
    row.name = "Serving Cell";
    view.rows.push_back(row);
    row.position = 1;
    row.time = Time(std::chrono::milliseconds(1250));
    row.difference = std::chrono::milliseconds(1250);
    row.note = "\u6C34\u6C34";
    view.rows.push_back(row);
    view.chosenRow = 1;
    DisplayRow cell;
    cell.name = "Cell";
    cell.isBranch = true;
    DisplayRow level;
    level.name = "Level";
    level.value = "-71 dBm";
    level.depth = 1;
    level.hasChanged = true;
    view.display = {cell, level};
    view.bytes = {0x01, 0x41, 0x42, 0xFF};
    view.field = FieldPlace{1, 3, 0, 16};
    view.status = " 4 bytes";
    return view;
}

TEST(BrowseScreenTest, FillsEveryScreenExactly) {
    const BrowseView view = exampleView();
    for (const BrowsePart part :
         {BrowsePart::Messages, BrowsePart::Display, BrowsePart::Content, BrowsePart::Events})
        for (const Characters characters : {Characters::Unicode, Characters::ASCII})
            for (std::size_t columns = 1; columns <= 220; columns += 7)
                for (std::size_t rows = 1; rows <= 70; rows += 3) {
                    BrowseView shown = view;
                    shown.part = part;
                    const std::vector<StyledLine> lines = browseScreen(shown, {columns, rows}, characters);
                    ASSERT_EQ(lines.size(), rows);
                    for (const StyledLine& line : lines)
                        ASSERT_EQ(widthOf(line), columns) << columns << "x" << rows;
                }
}

TEST(BrowseScreenTest, ShowsTheListTheDisplayAndTheBytes) {
    const std::vector<StyledLine> lines = browseScreen(exampleView(), {80, 24}, Characters::Unicode);
    EXPECT_EQ(plainText(lines[1]).substr(0, 61),
              "          1  00:00:00.000            0x5134    Serving Cell  ");
    EXPECT_EQ(plainText(lines[2]).substr(0, 63),
              ">         2  00:00:01.250    +1.250  0x5134    Serving Cell  * ");
    // 24 rows less two bars, two of the strip and a heading are 19, of which the list has 7. The bytes take
    // 39 columns: 4 of the offset, 2 blanks, 23 of digits, 2 blanks, 8 characters.
    EXPECT_EQ(plainText(lines[9]), " Cell                                    "
                                   "0000  01[41 42]ff              .AB.    ");
    EXPECT_EQ(plainText(lines[10]).substr(0, 17), "*  Level -71 dBm ");
}

TEST(BrowseScreenTest, ASCIIHasNoOtherCharacter) {
    for (const StyledLine& line : browseScreen(exampleView(), {60, 24}, Characters::ASCII))
        for (const char each : plainText(line))
            ASSERT_TRUE(each >= ' ' && each < '\x7F');
}

} // namespace
} // namespace velmora
