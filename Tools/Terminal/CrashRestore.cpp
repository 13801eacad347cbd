// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Terminal/CrashRestore.h"

#include <array>
#include <atomic>
#include <csignal>
#include <cstddef>

#include <unistd.h>

namespace velmora {

namespace {

constexpr int crashes[] = {SIGSEGV, SIGBUS, SIGFPE, SIGILL, SIGABRT};

std::atomic<bool> isKept = false;
std::string_view keptText;
termios keptSettings = {};
bool hasSettings = false;

/// Calls nothing that is not safe in a signal's handler.
void restoreAndEnd(int number) {
    if (isKept.exchange(false)) {
        const ssize_t written = ::write(STDOUT_FILENO, keptText.data(), keptText.size());
        if (hasSettings && written >= 0)
            ::tcsetattr(STDIN_FILENO, TCSANOW, &keptSettings);
    }
    // The handler was for one signal: this one ends the program.
    ::raise(number);
}

} // namespace

void restoreTerminalOnCrash(std::string_view text, const termios* settings) {
    // A stack of its own, since an overflow of the stack is a crash, too.
    static std::array<std::byte, 65536> stack;
    isKept = false;
    keptText = text;
    hasSettings = settings != nullptr;
    if (settings)
        keptSettings = *settings;
    isKept = true;
    stack_t own = {};
    own.ss_sp = stack.data();
    own.ss_size = stack.size();
    ::sigaltstack(&own, nullptr);
    struct sigaction action = {};
    action.sa_handler = restoreAndEnd;
    action.sa_flags = SA_ONSTACK | static_cast<int>(SA_RESETHAND);
    sigemptyset(&action.sa_mask);
    for (const int number : crashes)
        ::sigaction(number, &action, nullptr);
}

void forgetTerminalOnCrash() {
    isKept = false;
    for (const int number : crashes)
        std::signal(number, SIG_DFL);
}

} // namespace velmora
