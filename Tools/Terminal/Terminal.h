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
/// keys from standard input as they are pressed. `restore` or the destructor puts everything back. One per
/// process, on the main thread's event loop.
class Terminal {
public:
    struct Events {
        std::function<void(std::string_view bytes)> input;
        std::function<void()> resized;
        std::function<void()> hungUp; ///< the terminal has been closed
    };

    [[nodiscard]] static bool isThere();

    explicit Terminal(Events events);
    ~Terminal();
    Terminal(const Terminal&) = delete;
    Terminal& operator=(const Terminal&) = delete;

    [[nodiscard]] ScreenSize size() const;
    /// One write.
    void draw(std::string_view frame);
    /// Restores the terminal; nothing is drawn after that.
    void restore();

private:
    void watchSignals();
    void handleInput();
    void handleSignal();

    Events _events;
    bool _active = true;
    bool _hasKeys = false;
    termios _earlier = {};
    FileDescriptor _signals;
    std::unique_ptr<SocketWatch> _signalWatch;
    std::unique_ptr<SocketWatch> _inputWatch;
};

} // namespace velmora
