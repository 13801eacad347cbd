// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/Scrolling/ScrollView.h"
#include "Toolkit/Widgets/Tables/TableWidget.h"

#include <QPointingDevice>
#include <QScroller>
#include <QTest>
#include <QWheelEvent>

namespace velmora {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class TableTouchTest : public ::testing::Test {
protected:
    TableTouchTest() : stage(std::make_shared<ListPane>(numberedTexts(100))), pane(*stage.root) {
        stage.show();
    }

    [[nodiscard]] TableView& table() const { return pane.tableView(); }
    [[nodiscard]] QWidget* viewport() const {
        return static_cast<TableWidget*>(table().widget())->viewport();
    }
    /// A finger from one place to another, in steps that a finger makes.
    void stroke(QPoint from, QPoint to) const {
        QTest::touchEvent(viewport(), device).press(0, from, viewport());
        for (int step = 1; step <= 10; ++step) {
            QTest::qWait(10);
            QTest::touchEvent(viewport(), device).move(0, from + (to - from) * step / 10, viewport());
        }
        QTest::touchEvent(viewport(), device).release(0, to, viewport());
    }
    void wheel(QPoint angle, Qt::KeyboardModifiers modifiers = {}) const {
        // Up from what lies there, as far as it is not used.
        const QPoint place(20, 20);
        QWidget* there = viewport()->childAt(place);
        for (bool isUsed = false; there && !isUsed; there = there->parentWidget()) {
            const QPointF local =
                there->mapFrom(viewport()->window(), viewport()->mapTo(viewport()->window(), place));
            QWheelEvent event(local, viewport()->mapToGlobal(place), {}, angle, Qt::NoButton, modifiers,
                              Qt::NoScrollPhase, false);
            event.ignore();
            isUsed = QApplication::sendEvent(there, &event) && event.isAccepted();
        }
    }

    static inline QPointingDevice* const device = QTest::createTouchDevice();
    Stage stage;
    ListPane& pane;
};

TEST_F(TableTouchTest, ATapSelects) {
    QTest::touchEvent(viewport(), device).press(0, QPoint(20, 60), viewport());
    QTest::touchEvent(viewport(), device).release(0, QPoint(20, 60), viewport());
    runUntilIdle();
    EXPECT_THAT(pane.chosen, ElementsAre(1));
}

TEST_F(TableTouchTest, AStrokeScrollsAndSelectsNothing) {
    stroke({100, 400}, {100, 100});
    EXPECT_TRUE(eventually([&] { return table().contentOffset() > 100; }));
    QScroller::scroller(viewport())->stop();
    EXPECT_THAT(pane.chosen, IsEmpty());
}

TEST_F(TableTouchTest, ASidewaysStrokeMovesTheRowUnderTheFinger) {
    ScrollView scroller;
    scroller.setFrame({0, 0, 380, 44});
    scroller.setContentSize({900, 44});
    pane.cell(1)->contentView().addSubview(scroller);
    stroke({350, 60}, {50, 60});
    EXPECT_TRUE(eventually([&] { return scroller.contentOffset() > 100; }));
    QScroller::scroller(viewport())->stop();
    EXPECT_EQ(table().contentOffset(), 0);
    EXPECT_THAT(pane.chosen, IsEmpty());
}

TEST_F(TableTouchTest, TheWheelScrollsTheTableAndWithShiftTheRow) {
    ScrollView scroller;
    scroller.setFrame({0, 0, 380, 44});
    scroller.setContentSize({900, 44});
    pane.cell(0)->contentView().addSubview(scroller);
    wheel({0, -120}, Qt::ShiftModifier);
    EXPECT_EQ(scroller.contentOffset(), 120);
    EXPECT_EQ(table().contentOffset(), 0);
    wheel({-120, 0}); // a touchpad's sideways stroke
    EXPECT_EQ(scroller.contentOffset(), 240);
    wheel({0, -120});
    EXPECT_GT(table().contentOffset(), 0);
}

} // namespace
} // namespace velmora
