// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Drive/DriveModel.h"
#include "App/AppPlatform.h"
#include "App/DriveView/DriveHistory.h"
#include "App/DriveView/DriveViewController.h"

#include <functional>
#include <memory>
#include <string>

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

    [[nodiscard]] DriveModel& model() { return _model; }
    [[nodiscard]] const DriveHistory& history() const { return _history; }
    [[nodiscard]] DriveViewController& controller() { return *_controller; }
    [[nodiscard]] bool isShown() const;

    /// What the button does: shows the view, or closes it.
    void toggle();
    /// Shows it, on a narrow window too.
    void open();
    /// Whether the panes show what is received, as the view always does; they do at first. Otherwise the view
    /// and its button are hidden.
    void setLive(bool isLive);
    /// The connection was lost.
    void linkLost();
    /// Forgets everything, on the screen too.
    void forget();

private:
    [[nodiscard]] std::string link() const;
    void arrange();
    void setButton();

    AppPlatform& _platform;
    std::function<bool()> _isConnected;
    DriveHistory _history;
    DriveModel _model;
    std::shared_ptr<DriveViewController> _controller;
    std::shared_ptr<NavigationController> _stack;
    std::shared_ptr<NavigationController> _panes;
    std::shared_ptr<SplitController> _split;
    bool _isLive = true;
    bool _isOpen = false; ///< on a narrow window
    bool _isBeside;       ///< on a wide one
};

} // namespace velmora
