// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/DriveViewController.h"

#include <chrono>
#include <utility>

namespace velmora {

DriveViewController::DriveViewController(DriveSource& source, const Clock& clock, MainQueue& queue)
    : _source(&source), _clock(clock), _queue(queue) {
    setTitle("Drive");
}

DriveViewController::~DriveViewController() = default;

std::unique_ptr<View> DriveViewController::loadView() {
    auto view = std::make_unique<DriveView>(*_source, _clock);
    view->setBackgroundColor(Color::ground);
    view->buttons().setActions(_actions);
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

void DriveViewController::setSource(DriveSource& source) {
    _source = &source;
    if (!isViewLoaded())
        return;
    driveView().setSource(source);
    refreshNow();
}

void DriveViewController::recordingChanged() {
    if (isViewLoaded())
        driveView().buttons().update();
}

void DriveViewController::refreshNow() {
    _revision = _source->revision();
    _second = std::chrono::floor<std::chrono::seconds>(_source->moment());
    _shownLink = _source->link();
    driveView().update();
    showCharts();
}

void DriveViewController::showCharts() {
    _charted = _clock.now();
    driveView().updateEvents();
    driveView().updateCharts();
}

void DriveViewController::refresh() {
    if (!view().isOnScreen())
        return;
    const Time second = std::chrono::floor<std::chrono::seconds>(_source->moment());
    std::string link = _source->link();
    const bool isNewSecond = std::exchange(_second, second) != second;
    const bool isChanged = std::exchange(_revision, _source->revision()) != _source->revision();
    if (!isNewSecond && !isChanged && link == _shownLink)
        return; // not even an age has changed
    _shownLink = std::move(link);
    driveView().update();
    // A recording's list grows by many at once while it is read: it waits for the charts.
    if (isNewSecond && !_source->isRecorded())
        driveView().updateEvents();
    const Time now = _clock.now();
    // A clock may also be set back.
    if (now - _charted >= chartInterval || now < _charted)
        showCharts();
}

} // namespace velmora
