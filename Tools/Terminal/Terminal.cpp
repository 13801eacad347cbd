// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Terminal/Terminal.h"

#include "Tools/Terminal/CrashRestore.h"

#include <cerrno>
#include <csignal>
#include <utility>

#include <poll.h>
#include <sys/ioctl.h>
#include <sys/signalfd.h>
#include <unistd.h>

namespace velmora {

namespace {

constexpr std::string_view enterScreen = "\x1b[?1049h\x1b[?25l\x1b[2J";
constexpr std::string_view leaveScreen = "\x1b[0m\x1b[?25h\x1b[?1049l";

/// The signals that the terminal itself sends, and those that stop and continue the program.
sigset_t terminalSignals() {
    sigset_t signals;
    sigemptyset(&signals);
    for (const int number : {SIGWINCH, SIGHUP, SIGQUIT, SIGTSTP, SIGCONT})
        sigaddset(&signals, number);
    return signals;
}

void waitUntilWritable() {
    pollfd writable{STDOUT_FILENO, POLLOUT, 0};
    ::poll(&writable, 1, -1);
}

bool writeAll(std::string_view text) {
    while (!text.empty()) {
        const auto written = ::write(STDOUT_FILENO, text.data(), text.size());
        if (written >= 0)
            text.remove_prefix(static_cast<std::size_t>(written));
        else if (errno == EAGAIN || errno == EWOULDBLOCK)
            waitUntilWritable();
        else if (errno != EINTR)
            return false;
    }
    return true;
}

} // namespace

bool Terminal::isThere() {
    return ::isatty(STDOUT_FILENO) != 0;
}

Terminal::Terminal(Events events) : _events(std::move(events)) {
    watchSignals();
    _hasKeys = ::isatty(STDIN_FILENO) != 0 && ::tcgetattr(STDIN_FILENO, &_earlier) == 0;
    if (_hasKeys)
        _inputWatch =
            std::make_unique<SocketWatch>(STDIN_FILENO, SocketWatch::For::Reading, [this] { handleInput(); });
    enter();
}

void Terminal::enter() {
    restoreTerminalOnCrash(leaveScreen, _hasKeys ? &_earlier : nullptr);
    if (_hasKeys) {
        termios keys = _earlier;
        // Ctrl-C stays a signal. The keys that stop or abort a program are read like others: the screen is
        // restored first.
        keys.c_lflag &= ~static_cast<tcflag_t>(ICANON | ECHO | IEXTEN);
        keys.c_iflag &= ~static_cast<tcflag_t>(IXON);
        keys.c_cc[VSUSP] = _POSIX_VDISABLE;
        keys.c_cc[VQUIT] = _POSIX_VDISABLE;
        keys.c_cc[VMIN] = 1;
        keys.c_cc[VTIME] = 0;
        ::tcsetattr(STDIN_FILENO, TCSANOW, &keys);
    }
    writeAll(enterScreen);
}

void Terminal::leave() {
    writeAll(leaveScreen);
    if (_hasKeys)
        ::tcsetattr(STDIN_FILENO, TCSANOW, &_earlier);
    forgetTerminalOnCrash();
}

Terminal::~Terminal() {
    restore();
    const sigset_t signals = terminalSignals();
    ::sigprocmask(SIG_UNBLOCK, &signals, nullptr);
}

void Terminal::watchSignals() {
    const sigset_t signals = terminalSignals();
    ::sigprocmask(SIG_BLOCK, &signals, nullptr);
    _signals = FileDescriptor(::signalfd(-1, &signals, SFD_CLOEXEC | SFD_NONBLOCK));
    if (_signals.get() >= 0)
        _signalWatch = std::make_unique<SocketWatch>(_signals.get(), SocketWatch::For::Reading,
                                                     [this] { handleSignal(); });
}

ScreenSize Terminal::size() const {
    winsize window = {};
    if (::ioctl(STDOUT_FILENO, TIOCGWINSZ, &window) != 0 || window.ws_col == 0 || window.ws_row == 0)
        return {};
    return {window.ws_col, window.ws_row};
}

void Terminal::draw(std::string_view frame) {
    if (_active && !writeAll(frame))
        _events.hungUp();
}

void Terminal::suspend() {
    if (!_active)
        return;
    leave();
    ::raise(SIGSTOP);
    enter();
    _events.resized();
}

void Terminal::restore() {
    if (std::exchange(_active, false))
        leave();
}

void Terminal::handleInput() {
    char bytes[256];
    const ssize_t count = ::read(STDIN_FILENO, bytes, sizeof bytes);
    if (count > 0) {
        _events.input(std::string_view(bytes, static_cast<std::size_t>(count)));
    } else if (count == 0 || (errno != EINTR && errno != EAGAIN)) {
        _inputWatch->setEnabled(false);
        _events.hungUp();
    }
}

void Terminal::handleSignal() {
    signalfd_siginfo info = {};
    if (::read(_signals.get(), &info, sizeof info) != static_cast<ssize_t>(sizeof info))
        return;
    switch (static_cast<int>(info.ssi_signo)) {
    case SIGWINCH: _events.resized(); break;
    case SIGTSTP: suspend(); break;
    case SIGCONT:
        // Stopped by a signal that cannot be caught: others have used the terminal.
        if (_active) {
            enter();
            _events.resized();
        }
        break;
    default: _events.hungUp(); break;
    }
}

} // namespace velmora
