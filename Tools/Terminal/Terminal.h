// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Linux/Ports/SocketWatch.h"
#include "Tools/Terminal/ScreenSize.h"

#include <functional>
#include <memory>
#include <string_view>

#include <termios.h>

namespace velmora {

/// The terminal on standard output while a program draws on all of it: the alternate screen without a cursor,
/// keys from standard input as they are pressed. `restore` or the destructor puts everything back; so does a
/// signal by which the program crashes. A program that is stopped leaves the terminal as it was, and takes it
/// again when it continues. One per process, on the main thread's event loop.
class Terminal {
public:
    struct Events {
        std::function<void(std::string_view bytes)> input;
        std::function<void()> resized; ///< or all has to be drawn anew for another reason
        std::function<void()> hungUp;  ///< the terminal has been closed, or a signal ends the program
    };

    [[nodiscard]] static bool isThere();

    explicit Terminal(Events events);
    ~Terminal();
    Terminal(const Terminal&) = delete;
    Terminal& operator=(const Terminal&) = delete;

    [[nodiscard]] ScreenSize size() const;
    /// Whether keys can be read.
    [[nodiscard]] bool hasKeys() const { return _hasKeys; }
    /// One write.
    void draw(std::string_view frame);
    /// Restores the terminal and stops the program, until it is continued.
    void suspend();
    /// Restores the terminal; nothing is drawn after that.
    void restore();

private:
    void watchSignals();
    void handleInput();
    void handleSignal();
    void enter();
    void leave();

    Events _events;
    bool _active = true;
    bool _hasKeys = false;
    termios _earlier = {};
    FileDescriptor _signals;
    std::unique_ptr<SocketWatch> _signalWatch;
    std::unique_ptr<SocketWatch> _inputWatch;
};

} // namespace velmora
