// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Bars/LabelItem.h"
#include "Toolkit/Bars/SaveButton.h"
#include "Toolkit/BusyIndicator.h"
#include "Toolkit/Scrolling/ScrollView.h"
#include "Toolkit/TextField.h"
#include "Toolkit/Widgets/Accessibility.h"

#include <QAccessible>
#include <QTest>

namespace velmora {
namespace {

using ::testing::ElementsAre;

std::string nameOf(QWidget* widget) {
    QAccessibleInterface* const interface = QAccessible::queryAccessibleInterface(widget);
    return interface ? interface->text(QAccessible::Name).toStdString() : "(unknown)";
}

class AccessibilityTest : public ::testing::Test {
protected:
    AccessibilityTest() : stage(std::make_shared<ListPane>(numberedTexts(3), "Serving Cell")) {
        stage.stack->setToolbarHidden(false);
        stage.show();
        setAnnouncementListener([this](QWidget& widget, QAccessible::Event what) {
            if (what == QAccessible::Focus)
                announced.push_back("focus: " + nameOf(&widget));
            if (what == QAccessible::NameChanged)
                announced.push_back("name: " + nameOf(&widget));
        });
    }
    ~AccessibilityTest() override { setAnnouncementListener(nullptr); }
    [[nodiscard]] QAccessibleInterface* table() const {
        return QAccessible::queryAccessibleInterface(stage.root->view().widget());
    }

    Stage stage;
    std::vector<std::string> announced;
};

TEST_F(AccessibilityTest, ATableIsAListOfItsRows) {
    ASSERT_NE(table(), nullptr);
    EXPECT_EQ(table()->role(), QAccessible::List);
    ASSERT_EQ(table()->childCount(), 3);
    QAccessibleInterface* const row = table()->child(1);
    ASSERT_NE(row, nullptr);
    EXPECT_EQ(row->role(), QAccessible::ListItem);
    EXPECT_EQ(row->text(QAccessible::Name), "Row 1");
    EXPECT_EQ(row->parent(), table());
    EXPECT_EQ(table()->indexOfChild(row), 1);
    EXPECT_EQ(row->childCount(), 0);
    EXPECT_EQ(table()->child(3), nullptr);
}

TEST_F(AccessibilityTest, ARowIsCalledByNameAndValue) {
    TableCell cell(TableCellStyle::value, "value");
    ScrollView scroller;
    Label key("RSSI");
    Label value("-80 dBm");
    cell.contentView().addSubview(scroller);
    scroller.addSubview(key);
    scroller.addSubview(value);
    EXPECT_EQ(nameOf(cell.widget()), "RSSI, -80 dBm");
    value.setText("");
    EXPECT_EQ(nameOf(cell.widget()), "RSSI");
    value.setText("x");
    key.setHidden(true);
    EXPECT_EQ(nameOf(cell.widget()), "x");
    cell.setAccessibleName("Signal");
    EXPECT_EQ(nameOf(cell.widget()), "Signal");
}

TEST_F(AccessibilityTest, TheFocusRowIsAnnounced) {
    announced.clear();
    QTest::keyClick(stage.root->view().widget(), Qt::Key_Down);
    EXPECT_THAT(announced, ElementsAre("focus: Row 1"));
    QAccessibleInterface* const focused = table()->focusChild();
    ASSERT_NE(focused, nullptr);
    EXPECT_EQ(focused->text(QAccessible::Name), "Row 1");
    EXPECT_TRUE(focused->state().focused);
    EXPECT_FALSE(table()->child(0)->state().focused);
}

TEST_F(AccessibilityTest, AValueThatChangesIsAnnouncedOnce) {
    stage.root->tableView().reloadData();
    announced.clear();
    stage.root->texts[2] = "changed";
    stage.root->tableView().reloadData();
    stage.root->tableView().reloadData();
    EXPECT_THAT(announced, ElementsAre("name: changed"));
}

TEST_F(AccessibilityTest, ARowCanBePressed) {
    QAccessibleInterface* const row = table()->child(2);
    ASSERT_NE(row->actionInterface(), nullptr);
    EXPECT_THAT(
        row->actionInterface()->actionNames(),
        ElementsAre(QAccessibleActionInterface::pressAction(), QAccessibleActionInterface::setFocusAction()));
    row->actionInterface()->doAction(QAccessibleActionInterface::pressAction());
    EXPECT_THAT(stage.root->chosen, ElementsAre(2));
    EXPECT_TRUE(row->state().selected);
}

TEST_F(AccessibilityTest, TheBarsAreNamed) {
    stage.stack->pushViewController(std::make_shared<ListPane>(numberedTexts(1), "Neighbours"), false);
    auto busy = std::make_shared<BusyIndicator>();
    busy->startAnimating();
    stage.stack->topViewController()->setToolbarItems(
        {busy, std::make_shared<LabelItem>("Connecting..."), std::make_shared<SaveButton>(nullptr)}, false);
    runUntilIdle();
    QWidget* const title = find(stage.window, "velmora.title");
    EXPECT_EQ(nameOf(title), "Neighbours");
    EXPECT_EQ(QAccessible::queryAccessibleInterface(title)->role(), QAccessible::Heading);
    EXPECT_EQ(nameOf(find(stage.window, "velmora.back")), "Back to Serving Cell");
    EXPECT_EQ(nameOf(find(stage.window, "velmora.status")), "Connecting...");
    EXPECT_EQ(nameOf(find(stage.window, "velmora.save")), "Save");
    QWidget* const spinner = find(stage.window, "velmora.busy");
    EXPECT_EQ(nameOf(spinner), "Busy");
    EXPECT_TRUE(QAccessible::queryAccessibleInterface(spinner)->state().busy);
}

TEST_F(AccessibilityTest, AFieldIsCalledByItsPlaceholder) {
    TextField field;
    field.setPlaceholder("Description");
    EXPECT_EQ(nameOf(field.widget()), "Description");
    EXPECT_EQ(QAccessible::queryAccessibleInterface(field.widget())->role(), QAccessible::EditableText);
}

} // namespace
} // namespace velmora
