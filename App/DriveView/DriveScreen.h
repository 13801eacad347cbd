// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/AppPlatform.h"
#include "App/DriveView/DriveViewController.h"
#include "App/DriveView/LiveDrive.h"

#include <functional>
#include <memory>

namespace velmora {

class NavigationController;
class SplitController;

/// The drive view in the application's window: beside the panes where the window is wide enough, unless it
/// was closed there, which the preferences remember; a screen of its own with a way back otherwise. It owns
/// what feeds the view. Main thread only.
class DriveScreen {
public:
    /// `isConnected`: whether messages can arrive. The platform must outlive it.
    DriveScreen(AppPlatform& platform, std::function<bool()> isConnected);
    ~DriveScreen();
    DriveScreen(const DriveScreen&) = delete;
    DriveScreen& operator=(const DriveScreen&) = delete;

    /// The window's root: the panes, which get a button in their header, and the drive view.
    [[nodiscard]] std::shared_ptr<SplitController>
    standBeside(const std::shared_ptr<NavigationController>& panes);

    /// What is received.
    [[nodiscard]] DriveModel& model() { return _live.model(); }
    [[nodiscard]] const DriveHistory& history() const { return _live.history(); }
    /// What is shown.
    [[nodiscard]] DriveSource& source() { return *_source; }
    [[nodiscard]] DriveViewController& controller() { return *_controller; }
    [[nodiscard]] bool isShown() const;

    /// What the button does: shows the view, or closes it.
    void toggle();
    /// Shows it, on a narrow window too.
    void open();
    /// Shows a recording, which must outlive this until another takes its place; null for what is received,
    /// which is shown at first.
    void setRecorded(DriveSource* recorded);
    /// The moment of the recording is another.
    void showMoment();
    /// The connection was lost.
    void linkLost();
    /// Forgets everything, on the screen too.
    void forget();

private:
    void arrange();
    void setButton();

    AppPlatform& _platform;
    LiveDrive _live;
    DriveSource* _source = &_live;
    std::shared_ptr<DriveViewController> _controller;
    std::shared_ptr<NavigationController> _stack;
    std::shared_ptr<NavigationController> _panes;
    std::shared_ptr<SplitController> _split;
    bool _isOpen = false; ///< on a narrow window
    bool _isBeside;       ///< on a wide one
};

} // namespace velmora
