// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Watch/RowSearch.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;

const std::vector<TreeRow> rows = {
    {"Serving", true}, {"  Level  -71 dBm", false},   {"  Cell  17", false},   {"Neighbours", true},
    {"  0", true},     {"    Level  -90 dBm", false}, {"    Cell  18", false}, {"Mode  idle", false},
};

std::vector<std::string> textsOf(const std::vector<TreeRow>& found) {
    std::vector<std::string> texts;
    for (const TreeRow& row : found)
        texts.push_back(row.text);
    return texts;
}

TEST(RowSearchTest, FindsTheNextAndThePreviousRow) {
    EXPECT_EQ(findRow(rows, "level", 0, SearchDirection::Forward), 1U);
    EXPECT_EQ(findRow(rows, "LEVEL", 1, SearchDirection::Forward), 5U);
    EXPECT_EQ(findRow(rows, "level", 5, SearchDirection::Forward), std::nullopt);
    EXPECT_EQ(findRow(rows, "level", 5, SearchDirection::Backward), 1U);
    EXPECT_EQ(findRow(rows, "level", 1, SearchDirection::Backward), std::nullopt);
    EXPECT_EQ(findRow({}, "level", 9, SearchDirection::Backward), std::nullopt);
}

TEST(RowSearchTest, FindsSections) {
    EXPECT_EQ(findBranch(rows, 0, SearchDirection::Forward), 3U);
    EXPECT_EQ(findBranch(rows, 7, SearchDirection::Backward), 4U);
    EXPECT_EQ(findBranch(rows, 4, SearchDirection::Forward), std::nullopt);
}

TEST(RowSearchTest, FilteredRowsKeepTheirSections) {
    EXPECT_THAT(textsOf(rowsWith(rows, "-90")), ElementsAre("Neighbours", "  0", "    Level  -90 dBm"));
    EXPECT_THAT(textsOf(rowsWith(rows, "idle")), ElementsAre("Mode  idle"));
    // A section that has the text is shown as a whole.
    EXPECT_THAT(textsOf(rowsWith(rows, "serving")), ElementsAre("Serving", "  Level  -71 dBm", "  Cell  17"));
    EXPECT_EQ(rowsWith(rows, "").size(), rows.size());
    EXPECT_THAT(rowsWith(rows, "nothing"), ElementsAre());
}

} // namespace
} // namespace velmora
