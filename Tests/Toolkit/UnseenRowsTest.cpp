// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// All rows as screen readers see them, whether or not they are on the screen.

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Bars/LabelItem.h"

#include <QAccessible>

namespace velmora {
namespace {

using ::testing::ElementsAre;

/// Every third row opens, every third one has a check mark.
class MixedPane : public ListPane {
public:
    using ListPane::ListPane;
    [[nodiscard]] static TableCellAccessory accessory(std::size_t row) {
        return row % 3 == 0   ? TableCellAccessory::disclosureIndicator
               : row % 3 == 1 ? TableCellAccessory::checkMark
                              : TableCellAccessory::none;
    }
    [[nodiscard]] std::shared_ptr<TableCell> cellForRowAtIndexPath(TableView& tableView,
                                                                   const IndexPath& indexPath) override {
        auto cell = ListPane::cellForRowAtIndexPath(tableView, indexPath);
        cell->setAccessory(accessory(indexPath.row()));
        return cell;
    }
    [[nodiscard]] TableRowSummary summaryOfRowAtIndexPath(TableView&, const IndexPath& indexPath) override {
        return {texts[indexPath.row()], accessory(indexPath.row())};
    }
};

class UnseenRowsTest : public ::testing::Test {
protected:
    UnseenRowsTest() : stage(std::make_shared<MixedPane>(numberedTexts(100), "Cells")) {
        stage.stack->setToolbarHidden(false);
        stage.show();
    }
    [[nodiscard]] QAccessibleInterface* list() const {
        return QAccessible::queryAccessibleInterface(stage.root->view().widget());
    }

    Stage stage;
};

TEST_F(UnseenRowsTest, AListHasAllItsRowsInOrder) {
    ASSERT_EQ(list()->childCount(), 100);
    for (int row = 0; row < 100; ++row) {
        QAccessibleInterface* const child = list()->child(row);
        ASSERT_NE(child, nullptr) << row;
        EXPECT_TRUE(child->isValid());
        EXPECT_EQ(child->role(), QAccessible::ListItem);
        EXPECT_EQ(child->text(QAccessible::Name).toStdString(), "Row " + std::to_string(row));
        EXPECT_EQ(child->parent(), list());
        EXPECT_EQ(list()->indexOfChild(child), row);
        EXPECT_EQ(list()->child(row), child) << "a row is the same object each time";
        EXPECT_EQ(child->state().offscreen, row > 11) << row;
    }
    EXPECT_EQ(list()->child(100), nullptr);
    EXPECT_LE(stage.root->cellsMade, 12u); // no cell is made for what is not on the screen
}

TEST_F(UnseenRowsTest, RowsLieBelowEachOther) {
    for (int row = 1; row < 100; ++row) {
        const QRect above = list()->child(row - 1)->rect();
        const QRect place = list()->child(row)->rect();
        EXPECT_EQ(place.top(), above.bottom() + 1) << row;
        EXPECT_EQ(place.left(), above.left()) << row;
        EXPECT_EQ(place.width(), above.width()) << row;
    }
}

TEST_F(UnseenRowsTest, RowsThatOpenAndCheckMarksAreSaid) {
    for (const int first : {0, 90}) {
        const QAccessibleInterface* const opens = list()->child(first);
        EXPECT_TRUE(opens->state().expandable);
        EXPECT_TRUE(opens->state().collapsed);
        EXPECT_FALSE(opens->state().checkable);
        EXPECT_EQ(opens->text(QAccessible::Description), "Opens a list");
        const QAccessibleInterface* const checked = list()->child(first + 1);
        EXPECT_TRUE(checked->state().checkable);
        EXPECT_TRUE(checked->state().checked);
        EXPECT_TRUE(checked->state().readOnly);
        EXPECT_FALSE(checked->state().expandable);
        EXPECT_EQ(checked->text(QAccessible::Description), "");
        const QAccessibleInterface* const plain = list()->child(first + 2);
        EXPECT_FALSE(plain->state().checkable);
        EXPECT_FALSE(plain->state().expandable);
    }
}

TEST_F(UnseenRowsTest, AnUnseenRowCanBePressed) {
    QAccessibleInterface* const row = list()->child(80);
    ASSERT_NE(row->actionInterface(), nullptr);
    EXPECT_THAT(
        row->actionInterface()->actionNames(),
        ElementsAre(QAccessibleActionInterface::pressAction(), QAccessibleActionInterface::setFocusAction()));
    row->actionInterface()->doAction(QAccessibleActionInterface::pressAction());
    EXPECT_THAT(stage.root->chosen, ElementsAre(80));
    EXPECT_NE(stage.root->cell(80), nullptr) << "it is on the screen now";
    EXPECT_TRUE(row->state().selected);
    EXPECT_FALSE(row->state().offscreen);
    EXPECT_EQ(row->text(QAccessible::Name), "Row 80");
}

TEST_F(UnseenRowsTest, TheKeyboardGoesToAnUnseenRow) {
    list()->child(60)->actionInterface()->doAction(QAccessibleActionInterface::setFocusAction());
    EXPECT_EQ(stage.root->tableView().indexPathForFocusRow(), IndexPath(0, 60));
    EXPECT_TRUE(list()->child(60)->state().focused);
    EXPECT_EQ(list()->focusChild(), list()->child(60));
    EXPECT_THAT(stage.root->chosen, ::testing::IsEmpty());
}

TEST_F(UnseenRowsTest, ARowThatIsGoneSaysSo) {
    QAccessibleInterface* const row = list()->child(80);
    stage.root->texts.resize(20);
    stage.root->tableView().reloadData();
    EXPECT_FALSE(row->isValid());
    EXPECT_TRUE(row->state().invalid);
    EXPECT_EQ(row->text(QAccessible::Name), "");
    EXPECT_EQ(list()->indexOfChild(row), -1);
    EXPECT_EQ(list()->childCount(), 20);
    row->actionInterface()->doAction(QAccessibleActionInterface::pressAction());
    EXPECT_THAT(stage.root->chosen, ::testing::IsEmpty());
}

TEST_F(UnseenRowsTest, WindowToolbarAndSheetHaveTheirRoles) {
    const auto role = [](QWidget* widget) { return QAccessible::queryAccessibleInterface(widget)->role(); };
    QAccessibleInterface* const window = QAccessible::queryAccessibleInterface(stage.window.widget());
    EXPECT_EQ(window->role(), QAccessible::Window);
    EXPECT_EQ(window->text(QAccessible::Name), "Cells");
    stage.root->setToolbarItems({std::make_shared<LabelItem>("text")}, false);
    EXPECT_EQ(role(find(stage.window, "velmora.toolbar")), QAccessible::ToolBar);
    auto form = std::make_shared<ViewController>();
    form->setTitle("Form");
    stage.stack->presentModalViewController(form, false);
    QAccessibleInterface* const sheet =
        QAccessible::queryAccessibleInterface(find(stage.window, "velmora.sheet"));
    EXPECT_EQ(sheet->role(), QAccessible::Dialog);
    EXPECT_EQ(sheet->text(QAccessible::Name), "Form");
    EXPECT_TRUE(sheet->state().modal);
    stage.stack->dismissModalViewController(false);
}

} // namespace
} // namespace velmora
