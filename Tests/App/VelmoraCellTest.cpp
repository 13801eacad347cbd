// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/AppFixture.h"

#include <QWidget>

namespace velmora {
namespace {

/// Cells by themselves, of widths that the test makes from the texts' own.
class VelmoraCellTest : public AppFixture {
protected:
    static Size measured(const std::string& text) { return sizeOfText(text, Font::boldSystemFontOfSize(15)); }
    /// Where the label is drawn, to a whole point.
    static void expectDrawnAt(const Label& label, const Rect& place) {
        const QRect drawn = label.widget()->geometry();
        EXPECT_NEAR(drawn.x(), place.x, 1);
        EXPECT_NEAR(drawn.y(), place.y, 1);
        EXPECT_NEAR(drawn.width(), place.width, 1);
        EXPECT_NEAR(drawn.height(), place.height, 1);
    }
    /// A leaf row of that width.
    void layOut(VelmoraCell& cell, double width) const {
        cell.setFrame({0, 0, width, 44});
        cell.key().setText(key);
        cell.value()->setText(value);
        cell.setLayout();
        ASSERT_EQ(cell.contentView().bounds(), (Rect{0, 0, width, 44}));
    }

    std::string key = "RSSI of the serving cell";
    std::string value = "-80 dBm";
    double kw = measured(key).width;
    double kh = measured(key).height;
    double vw = measured(value).width;
    double vh = measured(value).height;
};

TEST_F(VelmoraCellTest, InnerRowHasTheNameInTheContentViewAlone) {
    VelmoraCell cell(VelmoraCell::StyleKey{TableCellStyle::value}, "identifier");
    EXPECT_EQ(cell.style(), TableCellStyle::value);
    EXPECT_EQ(cell.reuseIdentifier(), "identifier");
    EXPECT_EQ(cell.value(), nullptr);
    EXPECT_EQ(cell.view(), nullptr);
    EXPECT_EQ(cell.key().superview(), &cell.contentView());
    EXPECT_EQ(cell.key().font(), Font::boldSystemFontOfSize(15));
    EXPECT_EQ(cell.key().textAlignment(), TextAlignment::left);
}

TEST_F(VelmoraCellTest, LeafRowHasBothInAScrollingView) {
    VelmoraCell cell(TableCellStyle::value, "identifier");
    EXPECT_EQ(cell.style(), TableCellStyle::value);
    EXPECT_EQ(cell.reuseIdentifier(), "identifier");
    ASSERT_NE(cell.view(), nullptr);
    EXPECT_EQ(cell.view()->superview(), &cell.contentView());
    EXPECT_EQ(cell.key().superview(), cell.view());
    EXPECT_EQ(cell.value()->superview(), cell.view());
    EXPECT_EQ(cell.key().font(), Font::boldSystemFontOfSize(15));
    EXPECT_EQ(cell.value()->font(), Font::systemFontOfSize(15));
    EXPECT_EQ(cell.value()->textAlignment(), TextAlignment::left);
}

TEST_F(VelmoraCellTest, InnerRowsNameIsTenPointsInAndInTheMiddleOfTheHeight) {
    VelmoraCell cell(VelmoraCell::StyleKey{TableCellStyle::value}, "identifier");
    cell.setFrame({0, 0, 320, 60});
    cell.key().setText(key);
    cell.setLayoutKey();
    const Rect place{10, (60 - kh) * 0.5, kw, kh};
    EXPECT_EQ(cell.key().frame(), place);
    expectDrawnAt(cell.key(), place);
}

TEST_F(VelmoraCellTest, ValueThatFitsIsFlushWithTheRightEdge) {
    VelmoraCell cell(TableCellStyle::value, "identifier");
    const double width = kw + 60 + vw + 80;
    layOut(cell, width);
    const Rect keyPlace{10, (44 - kh) * 0.5, kw, kh};
    const Rect valuePlace{width - vw, (44 - vh) * 0.5, vw, vh};
    EXPECT_EQ(cell.key().frame(), keyPlace);
    EXPECT_EQ(cell.value()->frame(), valuePlace);
    expectDrawnAt(cell.key(), keyPlace);
    expectDrawnAt(*cell.value(), valuePlace);
    EXPECT_EQ(cell.view()->contentSize(), (Size{width, 50}));
    EXPECT_EQ(cell.view()->frame(), (Rect{0, 0, width, 50}));
    EXPECT_EQ(cell.view()->maximumOffset(), 0);
}

TEST_F(VelmoraCellTest, ValueThatDoesNotFitIsFiftyPointsAfterTheNameAndTheRowScrolls) {
    VelmoraCell cell(TableCellStyle::value, "identifier");
    const double width = kw + 60 + vw - 5;
    layOut(cell, width);
    EXPECT_EQ(cell.value()->frame(), (Rect{10 + kw + 50, (44 - vh) * 0.5, vw, vh}));
    EXPECT_EQ(cell.view()->contentSize(), (Size{width + kw + vw, 50}));
    EXPECT_EQ(cell.view()->frame(), (Rect{0, 0, width, 50}));
    EXPECT_GT(cell.view()->maximumOffset(), 0);
}

TEST_F(VelmoraCellTest, ValueThatFitsToThePointIsFiftyPointsAfterTheNameWithNothingToScroll) {
    VelmoraCell cell(TableCellStyle::value, "identifier");
    const double width = kw + 10 + 50 + vw;
    layOut(cell, width);
    EXPECT_EQ(cell.value()->frame().x, 10 + kw + 50);
    EXPECT_EQ(cell.view()->contentSize(), (Size{width, 50}));
    EXPECT_EQ(cell.view()->maximumOffset(), 0);
}

TEST_F(VelmoraCellTest, ValueIsMeasuredBold) {
    VelmoraCell cell(TableCellStyle::value, "identifier");
    value = "a value whose regular and bold widths differ";
    ASSERT_NE(measured(value).width, sizeOfText(value, Font::systemFontOfSize(15)).width);
    vw = measured(value).width;
    layOut(cell, 2000);
    EXPECT_EQ(cell.value()->frame().width, vw);
    EXPECT_EQ(cell.value()->frame().x, 2000 - vw);
}

TEST_F(VelmoraCellTest, LeafInACellMadeForInnerRowsIsLaidOutWithoutItsValue) {
    VelmoraCell cell(VelmoraCell::StyleKey{TableCellStyle::value}, "identifier");
    cell.setFrame({0, 0, 320, 44});
    cell.key().setText(key);
    cell.setLayout();
    EXPECT_EQ(cell.key().frame(), (Rect{10, (44 - kh) * 0.5, kw, kh}));
    EXPECT_EQ(cell.value(), nullptr);
}

TEST_F(VelmoraCellTest, LayoutFollowsTheCellsWidth) {
    VelmoraCell cell(TableCellStyle::value, "identifier");
    layOut(cell, kw + 60 + vw + 80);
    const double wider = kw + 60 + vw + 200;
    cell.setFrame({0, 0, wider, 44});
    cell.layoutSubviews();
    EXPECT_EQ(cell.value()->frame().x, wider - vw);
    const double narrower = kw + 60 + vw - 1;
    cell.setFrame({0, 0, narrower, 44});
    cell.layoutSubviews();
    EXPECT_EQ(cell.value()->frame().x, 10 + kw + 50);
}

} // namespace
} // namespace velmora
