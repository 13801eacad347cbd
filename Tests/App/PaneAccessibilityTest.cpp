// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/SaveScreenFixture.h"

#include <QAccessible>
#include <QWidget>

namespace velmora {
namespace {

/// Panes and save screen as screen readers see them.
class PaneAccessibilityTest : public SaveScreenFixture {
protected:
    [[nodiscard]] QAccessibleInterface* list() const {
        return QAccessible::queryAccessibleInterface(topPane()->tableView().widget());
    }
    /// More rows than the screen has room for: names, values, empty values and nodes that open.
    static Value longDisplay() {
        auto rows = std::make_shared<Dictionary>();
        for (int i = 10; i < 70; ++i) {
            const std::string name = "Row " + std::to_string(i);
            if (i % 3 == 0)
                rows->set(name, dictionary({{"Level", "-80 dBm"}, {"Quality", "-9 dB"}}));
            else
                rows->set(name, Value(i % 3 == 1 ? "-" + std::to_string(i) + " dBm" : std::string()));
        }
        return Value(rows);
    }
};

TEST_F(PaneAccessibilityTest, EveryRowSaysBeforeItIsSeenWhatItSaysThen) {
    launchAndConnect();
    show(longDisplay());
    TableView& table = topPane()->tableView();
    ASSERT_EQ(list()->childCount(), 60);
    int unseen = 0;
    for (int row = 0; row < 60; ++row) {
        QAccessibleInterface* const before = list()->child(row);
        unseen += before->state().offscreen ? 1 : 0;
        const TableRowSummary said = topPane()->summaryOfRowAtIndexPath(table, IndexPath(0, row));
        EXPECT_EQ(before->state().expandable, row % 3 == 2) << row; // the first is number 10
        const std::string number = std::to_string(row + 10);
        EXPECT_EQ(said.name, row % 3 == 0 ? "Row " + number + ", -" + number + " dBm" : "Row " + number);
        EXPECT_EQ(before->text(QAccessible::Name).toStdString(), said.name);
    }
    EXPECT_GT(unseen, 30);
}

TEST_F(PaneAccessibilityTest, ListsAreCalledAsTheirPanes) {
    launchAndConnect();
    show(dictionary({{"Cells", dictionary({{"Level", "-80 dBm"}, {"Quality", "-9 dB"}})}}));
    EXPECT_EQ(list()->text(QAccessible::Name), "Velmora");
    clickRow(0);
    ASSERT_EQ(depth(), 2u);
    EXPECT_EQ(list()->text(QAccessible::Name), "Cells");
    EXPECT_EQ(list()->child(0)->text(QAccessible::Name), "Level, -80 dBm");
}

TEST_F(PaneAccessibilityTest, SaveScreenIsADialogOfCheckedRows) {
    launchAndConnect();
    show(display("one"));
    open();
    QWidget* const table = saveScreen()->saveContentTable().widget();
    QAccessibleInterface* const contents = QAccessible::queryAccessibleInterface(table);
    EXPECT_EQ(contents->text(QAccessible::Name), "What is saved");
    ASSERT_EQ(contents->childCount(), 1);
    EXPECT_TRUE(contents->child(0)->state().checked);
    const TableRowSummary said =
        saveScreen()->summaryOfRowAtIndexPath(saveScreen()->saveContentTable(), IndexPath(0, 0));
    EXPECT_EQ(contents->child(0)->text(QAccessible::Name).toStdString(), said.name);
    EXPECT_EQ(said.accessory, TableCellAccessory::checkMark);
    int headings = 0;
    for (QWidget* const widget : shownWidgets("Save Snapshot")) {
        const auto role = QAccessible::queryAccessibleInterface(widget)->role();
        headings += role == QAccessible::Heading ? 1 : 0;
        EXPECT_EQ(QAccessible::queryAccessibleInterface(widget)->text(QAccessible::Name), "Save Snapshot");
        EXPECT_TRUE(role == QAccessible::Heading || role == QAccessible::Dialog);
    }
    EXPECT_EQ(headings, 1);
}

TEST_F(PaneAccessibilityTest, EmptyPanesSayThatNothingHasBeenReported) {
    launchAndConnect();
    EXPECT_TRUE(isShown("Nothing has been reported."));
    show(dictionary({{"Cells", dictionary({})}}));
    EXPECT_FALSE(isShown("Nothing has been reported."));
    clickRow(0);
    ASSERT_EQ(depth(), 2u);
    EXPECT_TRUE(isShown("Nothing has been reported."));
    EXPECT_TRUE(rows(*topPane()).empty());
}

} // namespace
} // namespace velmora
