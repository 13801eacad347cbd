// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/AppPlatform.h"
#include "App/DriveView/DriveSource.h"

#include <functional>

namespace velmora {

/// The drive that is received. Main thread only.
class LiveDrive final : public DriveSource {
public:
    /// `isConnected`: whether messages can arrive. The platform must outlive it.
    LiveDrive(AppPlatform& platform, std::function<bool()> isConnected);

    [[nodiscard]] DriveModel& model() { return _model; }

    [[nodiscard]] const DriveModel& model() const override { return _model; }
    [[nodiscard]] const DriveHistory& history() const override { return _history; }
    [[nodiscard]] DriveNow now() const override { return _model.now(); }
    [[nodiscard]] std::span<const Neighbour> neighbours() const override { return _model.neighbours(); }
    [[nodiscard]] Time moment() const override;
    [[nodiscard]] Time end() const override { return moment(); }
    [[nodiscard]] std::uint64_t revision() const override { return _model.messages(); }
    [[nodiscard]] std::string link() const override;
    bool togglePin(const std::string& path) override { return _model.togglePin(path); }

private:
    AppPlatform& _platform;
    std::function<bool()> _isConnected;
    DriveHistory _history;
    DriveModel _model;
};

} // namespace velmora
