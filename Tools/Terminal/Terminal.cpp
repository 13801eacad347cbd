// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Terminal/Terminal.h"

#include <cerrno>
#include <csignal>
#include <utility>

#include <poll.h>
#include <sys/ioctl.h>
#include <sys/signalfd.h>
#include <unistd.h>

namespace velmora {

namespace {

constexpr std::string_view enter = "\x1b[?1049h\x1b[?25l\x1b[2J";
constexpr std::string_view leave = "\x1b[0m\x1b[?25h\x1b[?1049l";

/// The signals that the terminal itself sends.
sigset_t terminalSignals() {
    sigset_t signals;
    sigemptyset(&signals);
    sigaddset(&signals, SIGWINCH);
    sigaddset(&signals, SIGHUP);
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
    if (::isatty(STDIN_FILENO) != 0 && ::tcgetattr(STDIN_FILENO, &_earlier) == 0) {
        _hasKeys = true;
        termios keys = _earlier;
        // Ctrl-C stays a signal. The keys that suspend or abort a program do nothing, since the screen could
        // not be restored.
        keys.c_lflag &= ~static_cast<tcflag_t>(ICANON | ECHO | IEXTEN);
        keys.c_iflag &= ~static_cast<tcflag_t>(IXON);
        keys.c_cc[VSUSP] = _POSIX_VDISABLE;
        keys.c_cc[VQUIT] = _POSIX_VDISABLE;
        keys.c_cc[VMIN] = 1;
        keys.c_cc[VTIME] = 0;
        ::tcsetattr(STDIN_FILENO, TCSANOW, &keys);
        _inputWatch =
            std::make_unique<SocketWatch>(STDIN_FILENO, SocketWatch::For::Reading, [this] { handleInput(); });
    }
    writeAll(enter);
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

void Terminal::restore() {
    if (!std::exchange(_active, false))
        return;
    writeAll(leave);
    if (_hasKeys)
        ::tcsetattr(STDIN_FILENO, TCSANOW, &_earlier);
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
    if (info.ssi_signo == SIGWINCH)
        _events.resized();
    else
        _events.hungUp();
}

} // namespace velmora
