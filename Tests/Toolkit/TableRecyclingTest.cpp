// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// Which cells rows get: as they leave and enter the screen, and on a reload. A row is 44 points high with the
// test machine's font (20 points of air around a line of 15), and the list has 604 - 52 (header) = 552
// points.

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Widgets/Tables/CellWidget.h"

namespace velmora {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class TableRecyclingTest : public ::testing::Test {
protected:
    TableRecyclingTest() : stage(std::make_shared<ListPane>(numberedTexts(100))), pane(*stage.root) {
        stage.show();
    }

    [[nodiscard]] TableView& table() const { return pane.tableView(); }
    [[nodiscard]] std::vector<TableCell*> visibleCells() const {
        std::vector<TableCell*> cells;
        for (const IndexPath& path : table().indexPathsForVisibleRows())
            cells.push_back(pane.cell(path.row()));
        return cells;
    }

    Stage stage;
    ListPane& pane;
};

TEST_F(TableRecyclingTest, OnlyRowsOnTheScreenHaveCells) {
    ASSERT_EQ(table().rowHeight(), 44);
    ASSERT_EQ(table().bounds().height, 552);
    // 552 / 44 = 12.5: the thirteenth row shows in part.
    EXPECT_EQ(table().indexPathsForVisibleRows().size(), 13U);
    EXPECT_EQ(pane.cellsMade, 13U);
    EXPECT_THAT(pane.asked, ElementsAre(0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12));
    EXPECT_NE(table().cellForRow({0, 12}), nullptr);
    EXPECT_EQ(table().cellForRow({0, 13}), nullptr);
    EXPECT_EQ(table().cellForRow({1, 0}), nullptr);
    EXPECT_EQ(table().cellForRow({}), nullptr);
}

TEST_F(TableRecyclingTest, ARowThatLeavesGivesItsCellToTheOneThatComes) {
    TableCell* const first = pane.cell(0);
    TableCell* const second = pane.cell(1);
    pane.asked.clear();
    table().setContentOffset(88); // rows 0 and 1 go, 13 and 14 come: 88 + 552 = 640 = 14.5 rows
    EXPECT_THAT(pane.asked, ElementsAre(13, 14));
    EXPECT_EQ(pane.cell(13), second); // the last one to go is the first one to come back
    EXPECT_EQ(pane.cell(14), first);
    EXPECT_EQ(pane.cell(13)->textLabel().text(), "Row 13");
    EXPECT_EQ(pane.cellsMade, 13U);
}

TEST_F(TableRecyclingTest, ScrollingFarReusesEveryCell) {
    table().scrollToRow({0, 99});
    EXPECT_EQ(table().contentOffset(), 100 * 44 - 552);
    EXPECT_EQ(pane.cellsMade, 13U);
    EXPECT_EQ(pane.cell(99)->textLabel().text(), "Row 99");
}

TEST_F(TableRecyclingTest, AReloadGivesEachRowTheCellItHad) {
    table().setContentOffset(100);
    const std::vector<TableCell*> before = visibleCells();
    const std::size_t made = pane.cellsMade;
    pane.asked.clear();
    pane.texts[5] = "changed";
    table().reloadData();
    EXPECT_EQ(visibleCells(), before);
    EXPECT_EQ(pane.cellsMade, made);
    EXPECT_THAT(pane.asked, ElementsAre(2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14));
    EXPECT_EQ(pane.cell(5)->textLabel().text(), "changed");
}

TEST_F(TableRecyclingTest, AReloadKeepsTheWidgetsOnTheScreen) {
    QWidget* const widget = pane.cell(3)->widget();
    table().reloadData();
    EXPECT_EQ(pane.cell(3)->widget(), widget);
    EXPECT_TRUE(widget->isVisible());
}

TEST_F(TableRecyclingTest, WhatAReloadHasNoUseForWaitsOutOfSight) {
    const std::shared_ptr<TableCell> third = table().cellForRow({0, 2});
    pane.texts.resize(2);
    table().reloadData();
    EXPECT_EQ(table().indexPathsForVisibleRows().size(), 2U);
    EXPECT_TRUE(third->isHidden());
    pane.texts.resize(3);
    table().reloadData();
    EXPECT_EQ(pane.cell(2), third.get());
    EXPECT_FALSE(third->isHidden());
    EXPECT_EQ(pane.cellsMade, 13U);
}

TEST_F(TableRecyclingTest, CellsComeBackUnderTheirOwnIdentifierOnly) {
    pane.identifier = "other";
    table().reloadData();
    EXPECT_EQ(pane.cellsMade, 26U);
    EXPECT_EQ(pane.cell(0)->reuseIdentifier(), "other");
    pane.identifier = "row";
    table().reloadData();
    EXPECT_EQ(pane.cellsMade, 26U);
    EXPECT_EQ(pane.cell(0)->reuseIdentifier(), "row");
    EXPECT_EQ(table().dequeueReusableCell("unheard of"), nullptr);
}

TEST_F(TableRecyclingTest, ARowBeforeTheOthersShiftsTheCells) {
    const std::vector<TableCell*> before = visibleCells();
    pane.texts.insert(pane.texts.begin(), "new");
    table().reloadData();
    EXPECT_EQ(visibleCells(), before); // by place, not by what they show
    EXPECT_EQ(pane.cell(0)->textLabel().text(), "new");
}

TEST_F(TableRecyclingTest, ACellGivenOutAgainHasItsRowsSize) {
    table().reloadData();
    EXPECT_EQ(pane.cell(0)->bounds().width, table().rectForRow({0, 0}).width);
    EXPECT_EQ(pane.cell(0)->bounds().height, 44);
    EXPECT_EQ(pane.cell(0)->contentView().bounds(), pane.cell(0)->bounds());
}

TEST_F(TableRecyclingTest, AReloadKeepsThePlace) {
    table().setContentOffset(1000);
    table().reloadData();
    EXPECT_EQ(table().contentOffset(), 1000);
    pane.texts.resize(20); // 20 * 44 - 552 = 328 is the most
    table().reloadData();
    EXPECT_EQ(table().contentOffset(), 328);
    pane.texts.clear();
    table().reloadData();
    EXPECT_EQ(table().contentOffset(), 0);
    EXPECT_THAT(table().indexPathsForVisibleRows(), IsEmpty());
}

TEST_F(TableRecyclingTest, AReloadKeepsFocusAndSelection) {
    table().setFocusRow({0, 4});
    table().selectRow({0, 6}, false);
    table().reloadData();
    EXPECT_EQ(table().indexPathForFocusRow(), IndexPath(0, 4));
    EXPECT_EQ(table().indexPathForSelectedRow(), IndexPath(0, 6));
    EXPECT_TRUE(pane.cell(6)->isSelected());
    EXPECT_FALSE(pane.cell(5)->isSelected());
    pane.texts.resize(3);
    table().reloadData();
    EXPECT_EQ(table().indexPathForFocusRow(), IndexPath(0, 2)); // the last that there is
    EXPECT_TRUE(table().indexPathForSelectedRow().isNull());
}

TEST_F(TableRecyclingTest, ARecycledCellIsNotSelected) {
    table().selectRow({0, 0}, false);
    TableCell* const cell = pane.cell(0);
    table().setContentOffset(44);
    EXPECT_EQ(pane.cell(13), cell);
    EXPECT_FALSE(cell->isSelected());
    table().setContentOffset(0);
    EXPECT_TRUE(pane.cell(0)->isSelected());
}

TEST_F(TableRecyclingTest, DeselectingConcernsTheSelectedRowAlone) {
    table().selectRow({0, 2}, false);
    table().deselectRow({0, 1}, false);
    table().deselectRow({}, false);
    EXPECT_EQ(table().indexPathForSelectedRow(), IndexPath(0, 2));
    table().deselectRow({0, 2}, false);
    EXPECT_TRUE(table().indexPathForSelectedRow().isNull());
    EXPECT_FALSE(pane.cell(2)->isSelected());
    EXPECT_THAT(pane.chosen, IsEmpty());
}

TEST_F(TableRecyclingTest, AResizeLaysTheCellsOutAgain) {
    const double before = pane.cell(0)->bounds().width;
    stage.window.widget()->resize(300, 604);
    runUntilIdle();
    EXPECT_EQ(pane.cell(0)->bounds().width, before - 100);
    EXPECT_EQ(pane.cell(0)->textLabel().frame().width, before - 100 - 20);
}

/// Two sections, the second without rows, and a third.
class Sections : public TableViewDataSource {
public:
    [[nodiscard]] std::size_t numberOfSections(TableView& /*tableView*/) override { return 3; }
    [[nodiscard]] std::size_t numberOfRowsInSection(TableView& /*tableView*/, std::size_t section) override {
        return section == 1 ? 0 : 2;
    }
    [[nodiscard]] std::shared_ptr<TableCell> cellForRowAtIndexPath(TableView& /*tableView*/,
                                                                   const IndexPath& indexPath) override {
        asked.push_back(indexPath);
        return nullptr;
    }
    std::vector<IndexPath> asked;
};

TEST_F(TableRecyclingTest, SectionsFollowEachOtherAndNoCellIsAnEmptyRow) {
    Sections sections;
    table().setDataSource(&sections);
    table().reloadData();
    EXPECT_THAT(sections.asked,
                ElementsAre(IndexPath(0, 0), IndexPath(0, 1), IndexPath(2, 0), IndexPath(2, 1)));
    EXPECT_EQ(table().numberOfSections(), 3U);
    EXPECT_EQ(table().numberOfRowsInSection(2), 2U);
    EXPECT_EQ(table().numberOfRowsInSection(3), 0U);
    EXPECT_EQ(table().rectForRow({2, 1}).y, 3 * 44);
    EXPECT_EQ(table().cellForRow({2, 1})->rowName(), "");
    table().setDataSource(&pane);
}

} // namespace
} // namespace velmora
