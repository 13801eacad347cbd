// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/AppFixture.h"

#include <QApplication>
#include <QEvent>
#include <QWidget>

namespace velmora {
namespace {

using FirstPaintTest = AppFixture;

/// Counts what the window draws before the first request to the service.
class PaintsBeforeConnecting : public QObject {
public:
    int paints = 0;

protected:
    bool eventFilter(QObject* watched, QEvent* event) override {
        if (event->type() == QEvent::Paint && watched->objectName() == "velmora.status")
            ++paints;
        return false;
    }
};

TEST_F(FirstPaintTest, TheStatusIsPaintedBeforeTheFirstExchange) {
    PaintsBeforeConnecting painted;
    QApplication::instance()->installEventFilter(&painted);
    int paintsAtStart = -1;
    app.setWillConnect([&]() -> Result<Done> {
        paintsAtStart = painted.paints;
        EXPECT_EQ(platform.telephony.connectionsAsked(), 0);
        return Done();
    });
    launch();
    platform.queue.runPending();
    runUntilIdle();
    EXPECT_GT(paintsAtStart, 0);
    EXPECT_EQ(platform.telephony.connectionsAsked(), 1);
}

TEST_F(FirstPaintTest, AWindowThatIsHiddenConnectsOnceItIsShown) {
    app.applicationDidFinishLaunching(app);
    QWidget* const window = pane(0)->view().widget()->window();
    window->hide();
    platform.queue.runPending();
    runUntilIdle();
    EXPECT_EQ(platform.telephony.connectionsAsked(), 0);
    window->show();
    runUntilIdle();
    EXPECT_EQ(platform.telephony.connectionsAsked(), 1);
    // Once only.
    window->hide();
    window->show();
    runUntilIdle();
    EXPECT_EQ(platform.telephony.connectionsAsked(), 1);
}

} // namespace
} // namespace velmora
