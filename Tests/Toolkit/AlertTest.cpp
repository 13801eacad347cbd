// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Alert.h"

#include <QApplication>
#include <QMessageBox>
#include <QPushButton>
#include <QTest>

namespace velmora {
namespace {

QMessageBox* shownAlert() {
    for (QWidget* const widget : QApplication::topLevelWidgets())
        if (auto* const box = dynamic_cast<QMessageBox*>(widget); box && box->isVisible())
            return box;
    return nullptr;
}

TEST(AlertTest, ItShowsAndStaysWithoutBlocking) {
    Stage stage(std::make_shared<ListPane>(numberedTexts(1)));
    stage.show();
    Alert("File Error", "Unable to write file to <disk>", "Close").show(); // and is gone
    runUntilIdle();
    QMessageBox* const box = shownAlert();
    ASSERT_NE(box, nullptr);
    EXPECT_EQ(box->objectName(), "velmora.alert");
    EXPECT_EQ(box->text(), "File Error");
    EXPECT_EQ(box->informativeText(), "Unable to write file to <disk>");
    EXPECT_EQ(box->textFormat(), Qt::PlainText);
    ASSERT_EQ(box->buttons().size(), 1);
    EXPECT_EQ(box->buttons()[0]->text(), "Close");
    EXPECT_EQ(box->parentWidget(), stage.window.widget());
    QTest::mouseClick(box->buttons()[0], Qt::LeftButton);
    runUntilIdle();
    EXPECT_EQ(shownAlert(), nullptr);
}

TEST(AlertTest, EscapeClosesIt) {
    Stage stage(std::make_shared<ListPane>(numberedTexts(1)));
    stage.show();
    Alert("Title", "Message", "Close").show();
    QMessageBox* const box = shownAlert();
    ASSERT_NE(box, nullptr);
    QTest::keyClick(box, Qt::Key_Escape);
    runUntilIdle();
    EXPECT_EQ(shownAlert(), nullptr);
}

} // namespace
} // namespace velmora
