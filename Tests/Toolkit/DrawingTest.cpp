// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// What is on the screen, read back from pictures of it.

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Widgets/Tables/TableWidget.h"
#include "Toolkit/Widgets/Text/LabelWidget.h"

#include <QApplication>
#include <QImage>
#include <QPalette>
#include <QStyle>

namespace velmora {
namespace {

QImage picture(QWidget& widget) {
    runUntilIdle();
    return widget.grab().toImage();
}

/// Whether any pixel of the area has another colour than its first.
bool hasInk(const QImage& image, const QRect& area) {
    for (int y = area.top(); y <= area.bottom(); ++y)
        for (int x = area.left(); x <= area.right(); ++x)
            if (image.pixel(x, y) != image.pixel(area.topLeft()))
                return true;
    return false;
}

class DrawingTest : public ::testing::Test {
protected:
    DrawingTest() : stage(std::make_shared<ListPane>(numberedTexts(3), "Title")), pane(*stage.root) {
        stage.show();
    }
    ~DrawingTest() override { QApplication::setPalette(QApplication::style()->standardPalette()); }

    [[nodiscard]] QImage row(std::size_t number) const { return picture(*pane.cell(number)->widget()); }

    Stage stage;
    ListPane& pane;
};

TEST_F(DrawingTest, APaletteThatChangesIsTakenUp) {
    QPalette dark;
    dark.setColor(QPalette::Window, QColor(20, 21, 22));
    dark.setColor(QPalette::Base, QColor(10, 11, 12));
    dark.setColor(QPalette::WindowText, QColor(240, 241, 242));
    dark.setColor(QPalette::Text, QColor(240, 241, 242));
    QApplication::setPalette(dark);
    const QImage whole = picture(*stage.window.widget());
    EXPECT_EQ(whole.pixelColor(200, 400), QColor(10, 11, 12)); // below the rows
    EXPECT_EQ(whole.pixelColor(395, 5), QColor(20, 21, 22));   // the header
    EXPECT_EQ(static_cast<LabelWidget*>(pane.cell(0)->textLabel().widget())->shownColor(),
              QColor(240, 241, 242));
    EXPECT_TRUE(hasInk(row(0), {10, 2, 100, 38}));
}

TEST_F(DrawingTest, ASelectedRowIsHighlightedWithItsText) {
    pane.tableView().selectRow({0, 1}, false);
    const QPalette palette = pane.cell(1)->widget()->palette();
    EXPECT_EQ(row(1).pixelColor(300, 20), palette.color(QPalette::Highlight));
    EXPECT_NE(row(0).pixelColor(300, 20), palette.color(QPalette::Highlight));
    const auto* const text = static_cast<LabelWidget*>(pane.cell(1)->textLabel().widget());
    EXPECT_EQ(text->shownColor(), palette.color(QPalette::HighlightedText));
}

TEST_F(DrawingTest, AccessoriesAreAtTheRightEdgeBesideTheContent) {
    TableCell& cell = *pane.cell(0);
    const double width = cell.bounds().width;
    const auto edge = [&] { return QRect(static_cast<int>(width) - 36, 2, 34, 38); };
    EXPECT_EQ(cell.contentView().bounds().width, width);
    EXPECT_FALSE(hasInk(row(0), edge()));
    cell.setAccessory(TableCellAccessory::disclosureIndicator);
    EXPECT_EQ(cell.contentView().bounds().width, width - 30);
    EXPECT_TRUE(hasInk(row(0), edge()));
    cell.setAccessory(TableCellAccessory::checkMark);
    EXPECT_EQ(cell.contentView().bounds().width, width - 40);
    EXPECT_TRUE(hasInk(row(0), edge()));
    cell.setAccessory(TableCellAccessory::none);
    EXPECT_FALSE(hasInk(row(0), edge()));
}

TEST_F(DrawingTest, RowsAreSetApartByALine) {
    const QImage image = row(0);
    EXPECT_NE(image.pixelColor(200, 43), image.pixelColor(200, 42));
    EXPECT_EQ(image.pixelColor(2, 43), image.pixelColor(2, 42)); // it begins with the text
}

TEST_F(DrawingTest, ATitleIsInTheMiddleAndKeepsItsEndsWhereItIsTooLong) {
    auto* const title = static_cast<LabelWidget*>(find(stage.window, "velmora.title"));
    EXPECT_NEAR(title->geometry().center().x(), 200, 1);
    pane.setTitle("From " + std::string(100, 'm') + " to");
    EXPECT_TRUE(title->shownText().startsWith("From\n")); // the word after it is wider than a line
    EXPECT_TRUE(title->shownText().endsWith(" to"));
    EXPECT_TRUE(title->shownText().contains(QChar(0x2026)));
}

TEST_F(DrawingTest, AValueCellHasItsTextsAtBothEdges) {
    TableCell cell(TableCellStyle::value, "value");
    cell.textLabel().setText("Left");
    cell.detailTextLabel().setText("Right");
    cell.layoutSubviews();
    const double wanted = sizeOfText("Right", cell.detailTextLabel().font()).width;
    EXPECT_EQ(cell.contentView().bounds(), (Rect{0, 0, 320, 44}));
    EXPECT_EQ(cell.detailTextLabel().frame(), (Rect{310 - wanted, 0, wanted, 44}));
    EXPECT_EQ(cell.textLabel().frame(), (Rect{10, 0, 300 - wanted - 10, 44}));
}

} // namespace
} // namespace velmora
