// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Geometry.h"

#include <functional>
#include <memory>
#include <string>

class QWidget;

namespace velmora {

class ViewController;

/// A window of the program, filled by its root controller's view. Closing the last one ends the application's
/// loop. Owned by its creator; destroying it removes it from the screen.
class Window {
public:
    /// Only the size of the frame counts: the desktop decides where windows go, and on a device whose windows
    /// fill the screen this one does.
    explicit Window(const Rect& frame);
    ~Window();
    Window(const Window&) = delete;
    Window& operator=(const Window&) = delete;

    [[nodiscard]] std::shared_ptr<ViewController> rootViewController() const;
    void setRootViewController(std::shared_ptr<ViewController> viewController);

    /// Brings the window up with the keyboard in it; the root controller is notified.
    void makeKeyAndVisible();
    /// Calls `painted` once, from the event loop, when the window's contents are on the screen: soon where
    /// they are, else after its first exposure. That comes from the display's server some time after the
    /// window was made visible, and never while nothing of the window is to be seen.
    void whenPainted(std::function<void()> painted);
    /// Draws what has changed now, for a caller that blocks the event loop next.
    void displayIfNeeded();
    /// Calls `command` when Ctrl and the capital letter are pressed, on whatever screen, a modal one
    /// included.
    void setCommand(char letter, std::function<void()> command);
    /// The same with Shift.
    void setShiftCommand(char letter, std::function<void()> command);
    /// Calls `dropped` with the path of a file that is dropped on the window, on whatever screen. Several at
    /// once, and what is no file of this machine, are refused.
    void setOnDrop(std::function<void(const std::string& path)> dropped);
    [[nodiscard]] bool isHidden() const;
    /// Takes the window off the screen, or puts it back.
    void setHidden(bool isHidden);
    /// The inside, from 0, 0.
    [[nodiscard]] Rect bounds() const;

    /// What draws the window, for the toolkit and its tests. Its parts are found by object name:
    /// "velmora.header", "velmora.title", "velmora.back", "velmora.toolbar", "velmora.busy",
    /// "velmora.status", "velmora.save", "velmora.table", "velmora.row", "velmora.sheet",
    /// "velmora.textField", "velmora.notice", "velmora.noticeButton", and "velmora.saveButton",
    /// "velmora.cancelButton", "velmora.button" by role; "velmora.alert" is a window of its own.
    [[nodiscard]] QWidget* widget() const;

private:
    class Impl;
    std::unique_ptr<Impl> _impl;
};

} // namespace velmora
