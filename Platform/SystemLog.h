// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

namespace velmora {

/// The priorities of syslog(3), most urgent first. The log takes any integer: the low three bits are the
/// priority, the rest is the facility, as in syslog(3).
namespace LogPriority {
inline constexpr int Emergency = 0;
inline constexpr int Error = 3;
inline constexpr int Warning = 4;
inline constexpr int Notice = 5;
inline constexpr int Info = 6;
inline constexpr int Debug = 7;
} // namespace LogPriority

/// Where log lines go: syslog(3), standard error, or a test's memory.
class SystemLog {
public:
    virtual ~SystemLog() = default;
    /// One line. A trailing line feed is part of the text.
    virtual void write(int priority, std::string_view text) = 0;
};

/// Sends the process's log lines to `log` from now on; those whose priority is above `level` (0 to 7) are
/// left out. Null discards them. The caller keeps `log` alive while it is set. Returns the earlier one.
SystemLog* setSystemLog(SystemLog* log, int level = LogPriority::Debug);

namespace detail {
inline int systemLogLevel = -1; ///< -1 while no log is set, so that no line is enabled
void writeToSystemLog(int priority, std::string_view text);
} // namespace detail

/// Whether a line of this priority would be written at all.
[[nodiscard]] inline bool isLogged(int priority) {
    return (priority & 7) <= detail::systemLogLevel;
}

/// Writes the text unchanged.
inline void logLine(int priority, std::string_view text) {
    if (isLogged(priority))
        detail::writeToSystemLog(priority, text);
}

/// Writes a line formatted as printf(3) does.
void logFormat(int priority, const char* format, ...) __attribute__((format(printf, 2, 3)));

} // namespace velmora
