// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/SyslogLog.h"
#include "Platform/SystemLog.h"

#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// Where a program sends its log lines: the values of `--log`.
enum class LogKind { Syslog, Stderr };

/// "syslog" or "stderr"; absent for anything else.
[[nodiscard]] std::optional<LogKind> logKindNamed(std::string_view name);

/// Installs a log of that kind during its lifetime; afterwards lines are discarded. Held by `main`, for
/// `--log` and `--log-level`.
class ProgramLog {
public:
    /// `level` is 0 to 7: lines of a higher priority value are discarded. `identity` is the program's name,
    /// `syslogSocket` as SyslogLog has it.
    ProgramLog(LogKind kind, int level, std::string identity,
               std::string syslogSocket = SyslogLog::standardSocket);
    ~ProgramLog();
    ProgramLog(const ProgramLog&) = delete;
    ProgramLog& operator=(const ProgramLog&) = delete;

private:
    std::unique_ptr<SystemLog> _log;
};

} // namespace velmora
