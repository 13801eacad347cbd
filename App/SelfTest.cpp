// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/SelfTest.h"

#include "App/VelmoraPaneController.h"
#include "App/VelmoraSaveViewController.h"
#include "Platform/SystemLog.h"
#include "Toolkit/Navigation/NavigationController.h"
#include "Toolkit/Tables/TableView.h"

namespace velmora {

namespace {

/// Between two steps; the screens are drawn meanwhile.
constexpr auto stepInterval = std::chrono::milliseconds(20);

} // namespace

SelfTest::SelfTest(VelmoraApp& app, std::chrono::nanoseconds timeLimit)
    : _app(app), _deadline(app.platform().model().clock.now() + timeLimit), _nextRows{0},
      _timer(app.platform().model().queue.repeating(stepInterval, [this] { step(); })) {}

void SelfTest::step() {
    if (_app.platform().model().clock.now() > _deadline) {
        end(_stage == Stage::Waiting ? "no data came" : "the screens took too long");
        return;
    }
    switch (_stage) {
    case Stage::Waiting: {
        // Reading the model's tree would add a display to the history that was never shown.
        auto& root = static_cast<VelmoraPaneController&>(*_app.navController().viewControllers().front());
        if (root.numberOfRowsInSection(root.tableView(), 0) > 0)
            _stage = Stage::Panes;
        break;
    }
    case Stage::Panes: stepThroughPanes(); break;
    case Stage::SaveScreenOpened:
        _app.closeSaveView();
        _stage = Stage::SaveScreenClosed;
        break;
    case Stage::SaveScreenClosed:
        if (!_app.navController().modalViewController())
            end(nullptr);
        break;
    }
}

void SelfTest::stepThroughPanes() {
    NavigationController& stack = _app.navController();
    // A redraw may have taken panes off that have no node any more.
    if (stack.viewControllers().size() < _nextRows.size())
        _nextRows.resize(stack.viewControllers().size());
    const auto pane = std::static_pointer_cast<VelmoraPaneController>(stack.topViewController());
    TableView& table = pane->tableView();
    if (_nextRows.back() < pane->numberOfRowsInSection(table, 0)) {
        const IndexPath row(0, _nextRows.back()++);
        table.scrollToRow(row);
        table.selectRow(row, false);
        pane->didSelectRowAtIndexPath(table, row);
        if (stack.topViewController() != pane) {
            _nextRows.push_back(0);
            ++_panesOpened;
        }
    } else if (_nextRows.size() > 1) {
        stack.popViewController(true);
        _nextRows.pop_back();
    } else {
        openSaveScreen();
    }
}

void SelfTest::openSaveScreen() {
    _app.showSaveView();
    if (_app.navController().modalViewController())
        _stage = Stage::SaveScreenOpened;
    else
        end("the save screen did not open");
}

void SelfTest::end(const char* failure) {
    _timer->invalidate();
    if (failure)
        logFormat(LogPriority::Error, "Self-test: %s", failure);
    else
        logFormat(LogPriority::Notice, "Self-test: opened %d panes and the save screen", _panesOpened);
    _app.terminate(failure ? 1 : 0);
}

} // namespace velmora
