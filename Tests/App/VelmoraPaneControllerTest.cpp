// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/AppFixture.h"

#include "Toolkit/Bars/FlexibleSpace.h"
#include "Toolkit/Bars/LabelItem.h"
#include "Toolkit/Bars/SaveButton.h"
#include "Toolkit/BusyIndicator.h"

#include <QTest>
#include <QWidget>
#include <QWindow>

#include <filesystem>
#include <string>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class VelmoraPaneControllerTest : public AppFixture {
protected:
    static Value twoSections() {
        return dictionary({{"Serving Cell", dictionary({{"ARFCN", "18"}, {"BSIC", "36"}})},
                           {"State", "Idle"},
                           {"Neighbours", Value(makeArray())}});
    }
    static Value leaves(std::size_t count) {
        const auto all = makeDictionary();
        for (std::size_t i = 0; i < count; ++i)
            all->set("leaf " + std::to_string(i), std::to_string(i));
        return Value(all);
    }
    void press(Qt::Key key, Qt::KeyboardModifiers modifiers = {}) {
        QTest::keyClick(topPane()->view().widget()->window()->windowHandle(), key, modifiers);
        runUntilIdle();
    }
};

TEST_F(VelmoraPaneControllerTest, NewPaneIsLoadingWithAnEmptyStatus) {
    VelmoraPaneController fresh(nullptr, "/A/B", app);
    fresh.createToolbarItems();
    EXPECT_EQ(fresh.path(), "/A/B");
    EXPECT_EQ(status(fresh), "");
    EXPECT_TRUE(isSpinning(fresh));
    EXPECT_EQ(fresh.numberOfSections(fresh.tableView()), 1u);
    EXPECT_EQ(fresh.numberOfRowsInSection(fresh.tableView(), 0), 0u);
}

TEST_F(VelmoraPaneControllerTest, ToolbarHoldsIndicatorTextSpaceAndOnInternalInstallsTheButton) {
    VelmoraPaneController pane(nullptr, "/", app);
    pane.setStatus("Searching", false);
    const auto& plain = pane.toolbarItems();
    ASSERT_EQ(plain.size(), 3u);
    const auto indicator = std::dynamic_pointer_cast<BusyIndicator>(plain[0]);
    ASSERT_NE(indicator, nullptr);
    EXPECT_FALSE(indicator->isAnimating());
    EXPECT_TRUE(indicator->hidesWhenStopped());
    const auto label = std::dynamic_pointer_cast<LabelItem>(plain[1]);
    ASSERT_NE(label, nullptr);
    EXPECT_EQ(label->text(), "Searching");
    EXPECT_EQ(label->font(), Font::systemFontOfSize(14));
    EXPECT_EQ(label->backgroundColor(), Color::clear);
    EXPECT_EQ(label->textColor(), Color::darkText);
    EXPECT_NE(std::dynamic_pointer_cast<FlexibleSpace>(plain[2]), nullptr);

    app.setAllowSaveButton(true);
    pane.createToolbarItems();
    ASSERT_EQ(pane.toolbarItems().size(), 4u);
    EXPECT_NE(std::dynamic_pointer_cast<SaveButton>(pane.toolbarItems()[3]), nullptr);
}

TEST_F(VelmoraPaneControllerTest, AbsentStatusShowsAnEmptyLabel) {
    VelmoraPaneController pane(nullptr, "/", app);
    pane.setStatus("Searching", true);
    pane.setStatus(std::nullopt, true);
    EXPECT_EQ(status(pane), "");
    EXPECT_TRUE(isSpinning(pane));
}

TEST_F(VelmoraPaneControllerTest, TitleIsTheNodesNameOrTheApplications) {
    launchAndConnect();
    EXPECT_EQ(pane(0)->title(), "Velmora");
    EXPECT_TRUE(isShown("Velmora"));
    show(twoSections());
    clickRow(0);
    ASSERT_EQ(depth(), 2u);
    EXPECT_EQ(topPane()->title(), "Serving Cell");
    EXPECT_TRUE(isShown("Serving Cell"));
    topPane()->reloadWithNode(nullptr);
    EXPECT_EQ(topPane()->title(), "Velmora");
    EXPECT_EQ(topPane()->path(), "/Serving Cell"); // the path is not the node's
}

TEST_F(VelmoraPaneControllerTest, PaneBringsTheStacksToolbarUp) {
    launch();
    EXPECT_FALSE(app.navController().isToolbarHidden());
    EXPECT_TRUE(isShown("Connecting..."));
}

TEST_F(VelmoraPaneControllerTest, RowsShowNamesMarksAndValues) {
    launchAndConnect();
    show(twoSections());
    EXPECT_THAT(rows(*pane(0)), ElementsAre("Serving Cell", "State: Idle", "Neighbours"));
    EXPECT_EQ(cell(*pane(0), 0)->accessory(), TableCellAccessory::disclosureIndicator);
    EXPECT_EQ(cell(*pane(0), 1)->accessory(), TableCellAccessory::none);
    EXPECT_EQ(cell(*pane(0), 2)->accessory(), TableCellAccessory::disclosureIndicator);
    for (std::size_t row = 0; row < 3; ++row) {
        EXPECT_EQ(cell(*pane(0), row)->style(), TableCellStyle::value);
        EXPECT_EQ(cell(*pane(0), row)->reuseIdentifier(), "VelmoraPaneControllerCell");
    }
}

TEST_F(VelmoraPaneControllerTest, RowsAreLaidOutInTheTablesWidth) {
    launchAndConnect();
    show(twoSections());
    const auto row = cell(*pane(0), 1);
    const double width = pane(0)->tableView().bounds().width;
    EXPECT_EQ(row->contentView().bounds().width, width);
    EXPECT_EQ(row->value()->frame().x, width - row->value()->frame().width);
    // Drawn where the layout says: the value ends at the table's right edge.
    const QWidget* drawn = row->value()->widget();
    const int right = drawn->mapTo(drawn->window(), QPoint(drawn->width(), 0)).x();
    EXPECT_NEAR(right, width, 1);
}

TEST_F(VelmoraPaneControllerTest, RowsAreLaidOutAgainWhenTheWidthChanges) {
    launchAndConnect();
    show(twoSections());
    QWidget* window = pane(0)->view().widget()->window();
    window->resize(window->width() + 300, window->height());
    ASSERT_TRUE(eventually([&] { return pane(0)->tableView().bounds().width >= window->width(); }));
    runUntilIdle();
    const auto row = cell(*pane(0), 1);
    EXPECT_EQ(row->contentView().bounds().width, window->width());
    EXPECT_EQ(row->value()->frame().x, window->width() - row->value()->frame().width);
}

TEST_F(VelmoraPaneControllerTest, SectionOpensItsPaneWithThisOnesStatus) {
    launchAndConnect();
    show(twoSections());
    clickRow(0);
    ASSERT_EQ(depth(), 2u);
    EXPECT_EQ(topPane()->path(), "/Serving Cell");
    EXPECT_THAT(rows(*topPane()), ElementsAre("ARFCN: 18", "BSIC: 36"));
    EXPECT_EQ(status(*topPane()), "Updated 2026-11-16 at 05:00:02");
    EXPECT_FALSE(isSpinning(*topPane()));
    EXPECT_TRUE(isShown("Updated 2026-11-16 at 05:00:02"));
}

TEST_F(VelmoraPaneControllerTest, NewPaneHasTheStatusBeforeTheStackShowsIt) {
    launchAndConnect();
    show(twoSections());
    app.navController().setDelegate(nullptr); // it is not refreshed when shown
    pane(0)->setStatus("as it was", true);
    clickRow(0);
    ASSERT_EQ(depth(), 2u);
    EXPECT_EQ(status(*topPane()), "as it was");
    EXPECT_TRUE(isSpinning(*topPane()));
}

TEST_F(VelmoraPaneControllerTest, EmptySectionOpensAnEmptyPane) {
    launchAndConnect();
    show(twoSections());
    clickRow(2);
    ASSERT_EQ(depth(), 2u);
    EXPECT_EQ(topPane()->path(), "/Neighbours");
    EXPECT_EQ(topPane()->tableView().numberOfRowsInSection(0), 0u);
    EXPECT_THAT(rows(*topPane()), IsEmpty());
}

TEST_F(VelmoraPaneControllerTest, LeafOpensNothingAndStaysUnselected) {
    launchAndConnect();
    show(twoSections());
    clickRow(1);
    EXPECT_EQ(depth(), 1u);
    EXPECT_TRUE(pane(0)->tableView().indexPathForSelectedRow().isNull());
}

TEST_F(VelmoraPaneControllerTest, NullPathIsIgnored) {
    launchAndConnect();
    show(twoSections());
    pane(0)->didSelectRowAtIndexPath(pane(0)->tableView(), IndexPath());
    EXPECT_EQ(depth(), 1u);
}

TEST_F(VelmoraPaneControllerTest, KeysOpenASectionAndLeaveIt) {
    launchAndConnect();
    show(twoSections());
    pane(0)->tableView().becomeFirstResponder();
    pane(0)->tableView().setFocusRow(IndexPath(0, 1));
    press(Qt::Key_Up);
    press(Qt::Key_Return);
    ASSERT_EQ(depth(), 2u);
    EXPECT_EQ(topPane()->path(), "/Serving Cell");
    press(Qt::Key_Escape);
    EXPECT_EQ(depth(), 1u);
    EXPECT_TRUE(pane(0)->tableView().indexPathForSelectedRow().isNull());
}

TEST_F(VelmoraPaneControllerTest, ReloadKeepsThePlaceScrolledTo) {
    launchAndConnect();
    show(leaves(60));
    pane(0)->tableView().setContentOffset(500);
    show(leaves(60));
    EXPECT_EQ(pane(0)->tableView().contentOffset(), 500);
}

TEST_F(VelmoraPaneControllerTest, LeafInACellMadeForASectionShowsItsNameOnly) {
    launchAndConnect();
    show(dictionary({{"Cell", dictionary({{"a", "1"}, {"b", "2"}})}, {"State", "Idle"}}));
    ASSERT_THAT(rows(*pane(0)), ElementsAre("Cell", "State: Idle"));
    const auto first = cell(*pane(0), 0);
    // The rows change places, the cells do not.
    show(dictionary({{"State", "Busy"}, {"Cell", dictionary({{"a", "1"}, {"b", "2"}})}}));
    EXPECT_EQ(cell(*pane(0), 0), first);
    EXPECT_EQ(first->key().text(), "State");
    EXPECT_EQ(first->value(), nullptr);
    EXPECT_EQ(first->accessory(), TableCellAccessory::none);
    EXPECT_FALSE(isShown("Busy"));
    // The section, in a cell made for a leaf, has nothing in its value label.
    const auto second = cell(*pane(0), 1);
    EXPECT_EQ(second->key().text(), "Cell");
    ASSERT_NE(second->value(), nullptr);
    EXPECT_EQ(second->value()->text(), "");
    EXPECT_EQ(second->accessory(), TableCellAccessory::disclosureIndicator);
}

TEST_F(VelmoraPaneControllerTest, LeavingOnlyGivesTheKeyboardUp) {
    launchAndConnect();
    show(twoSections());
    const auto root = pane(0);
    ASSERT_TRUE(root->tableView().becomeFirstResponder());
    root->viewWillDisappear(false);
    EXPECT_FALSE(root->tableView().isFirstResponder());
}

TEST_F(VelmoraPaneControllerTest, SaveButtonOpensTheSaveScreen) {
    std::filesystem::create_directories(directory / marker);
    launchAndConnect();
    const auto buttons = shownWidgets("Save");
    ASSERT_EQ(buttons.size(), 1u);
    click(buttons[0]);
    EXPECT_NE(saveScreen(), nullptr);
}

TEST_F(VelmoraPaneControllerTest, WithoutTheMarkerThereIsNoSaveButtonOnTheScreen) {
    launchAndConnect();
    EXPECT_THAT(shownWidgets("Save"), IsEmpty());
}

} // namespace
} // namespace velmora
