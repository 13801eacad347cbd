// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/SystemLog.h"

#include <cstdio>
#include <deque>
#include <string>
#include <string_view>
#include <utility>

namespace velmora {

/// Replaces the process's system log during its lifetime, at the log's own level; the destructor restores it.
/// The subclasses keep log lines from mixing with a command's output on the same terminal.
class LogOverride : public SystemLog {
public:
    LogOverride();
    ~LogOverride() override;
    LogOverride(const LogOverride&) = delete;
    LogOverride& operator=(const LogOverride&) = delete;

protected:
    void pass(int priority, std::string_view text);

private:
    int _level;
    SystemLog* _earlier;
};

/// Holds the latest lines, those of the console as well, while the screen is in use, and passes them on
/// afterwards.
class DeferredLog final : public LogOverride {
public:
    static constexpr std::size_t maximumLines = 200;

    DeferredLog();
    ~DeferredLog() override;
    void write(int priority, std::string_view text) override;
    /// Writes the deferred lines now, and later ones as they arise.
    void release();

private:
    std::deque<std::pair<int, std::string>> _lines;
    std::size_t _leftOut = 0;
    bool _released = false;
    char* _consoleText = nullptr;
    std::size_t _consoleSize = 0;
    std::FILE* _console;
    std::FILE* _earlierConsole;
};

/// One line on standard error that is rewritten in place. A log line replaces it until the next `show`.
class ProgressLine final : public LogOverride {
public:
    ~ProgressLine() override { clear(); }
    void show(std::string_view text);
    void clear();
    void write(int priority, std::string_view text) override;

private:
    bool _shown = false;
};

} // namespace velmora
