// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/DriveScreen.h"

#include "Toolkit/Navigation/NavigationController.h"
#include "Toolkit/Navigation/SplitController.h"

#include <utility>

namespace velmora {

namespace {

constexpr const char* domain = "com.velmora.velmora";
/// Preferences that are not there are false.
constexpr const char* closedKey = "DriveViewClosed";
constexpr const char* buttonTitle = "Drive";

} // namespace

DriveScreen::DriveScreen(AppPlatform& platform, std::function<bool()> isConnected)
    : _platform(platform), _live(platform, std::move(isConnected)),
      _controller(
          std::make_shared<DriveViewController>(_live, platform.model().clock, platform.model().queue)),
      _stack(std::make_shared<NavigationController>(_controller)),
      _isBeside(!platform.preferences().boolean(domain, closedKey)) {
    _stack->setNamesWindow(false); // the panes do
}

DriveScreen::~DriveScreen() {
    if (_split)
        _split->setOnWidthChanged({});
}

std::shared_ptr<SplitController>
DriveScreen::standBeside(const std::shared_ptr<NavigationController>& panes) {
    _panes = panes;
    _panes->setHeaderCommand(buttonTitle, [this] { toggle(); });
    _split = std::make_shared<SplitController>(panes, _stack);
    _split->setOnWidthChanged([this] { arrange(); });
    arrange();
    return _split;
}

void DriveScreen::arrange() {
    // Beside the panes there is nothing to go back to.
    if (_split->isWide())
        _stack->setLeave({}, {});
    else
        _stack->setLeave("Velmora", [this] { toggle(); });
    _split->setSecondShown(_split->isWide() ? _isBeside : _isOpen);
}

bool DriveScreen::isShown() const {
    return _split && _split->isSecondShown();
}

void DriveScreen::setRecorded(DriveSource* recorded) {
    _source = recorded ? recorded : &_live;
    _controller->setSource(*_source);
}

void DriveScreen::showMoment() {
    if (isShown())
        _controller->refreshNow();
}

void DriveScreen::toggle() {
    if (!_split)
        return;
    if (_split->isWide()) {
        _isBeside = !_isBeside;
        _platform.preferences().setBoolean(domain, closedKey, !_isBeside);
        _platform.preferences().synchronize(domain);
    } else {
        _isOpen = !_isOpen;
    }
    arrange();
}

void DriveScreen::open() {
    _isOpen = _isBeside = true;
    if (_split)
        arrange();
}

void DriveScreen::linkLost() {
    _live.model().interrupt();
}

void DriveScreen::forget() {
    _live.model().reset();
    if (isShown())
        _controller->refreshNow();
}

} // namespace velmora
