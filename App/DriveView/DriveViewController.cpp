// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/DriveViewController.h"

#include <chrono>
#include <utility>

namespace velmora {

DriveViewController::DriveViewController(const DriveModel& model, const DriveHistory& history,
                                         const Clock& clock, MainQueue& queue,
                                         std::function<std::string()> link)
    : _model(model), _history(history), _clock(clock), _queue(queue), _link(std::move(link)) {
    setTitle("Drive");
}

DriveViewController::~DriveViewController() = default;

std::unique_ptr<View> DriveViewController::loadView() {
    auto view = std::make_unique<DriveView>(_model, _history, _clock);
    view->setBackgroundColor(Color::ground);
    return view;
}

void DriveViewController::viewWillAppear(bool animated) {
    ViewController::viewWillAppear(animated);
    refreshNow();
    _timer = _queue.repeating(refreshInterval, [this] { refresh(); });
}

void DriveViewController::viewWillDisappear(bool animated) {
    ViewController::viewWillDisappear(animated);
    _timer.reset();
}

bool DriveViewController::becomeFirstResponder() {
    return driveView().neighbours().becomeFirstResponder();
}

void DriveViewController::refreshNow() {
    const Time now = _clock.now();
    _messages = _model.messages();
    _second = std::chrono::floor<std::chrono::seconds>(now);
    _shownLink = _link();
    driveView().update(now, _shownLink);
    driveView().updateCharts(now);
}

void DriveViewController::refresh() {
    if (!view().isOnScreen())
        return;
    const Time now = _clock.now();
    const Time second = std::chrono::floor<std::chrono::seconds>(now);
    std::string link = _link();
    const bool isNewSecond = std::exchange(_second, second) != second;
    const bool hasMessages = std::exchange(_messages, _model.messages()) != _model.messages();
    if (!isNewSecond && !hasMessages && link == _shownLink)
        return; // not even an age has changed
    _shownLink = std::move(link);
    driveView().update(now, _shownLink);
    if (isNewSecond)
        driveView().updateCharts(now);
}

} // namespace velmora
