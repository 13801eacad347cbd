// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/LiveDrive.h"

#include <utility>

namespace velmora {

LiveDrive::LiveDrive(AppPlatform& platform, std::function<bool()> isConnected)
    : _platform(platform), _isConnected(std::move(isConnected)),
      _model(_history, platform.model().clock, [&platform] { return platform.ruleFiles(); }) {}

Time LiveDrive::moment() const {
    return _platform.model().clock.now();
}

std::string LiveDrive::link() const {
    if (_isConnected())
        return {};
    return _model.messages() > 0 ? "Link lost: no messages arrive" : "Not connected";
}

} // namespace velmora
