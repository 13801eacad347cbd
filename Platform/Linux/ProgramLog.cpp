// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/ProgramLog.h"

#include "Platform/Linux/StderrLog.h"

#include <utility>

namespace velmora {

std::optional<LogKind> logKindNamed(std::string_view name) {
    if (name == "syslog")
        return LogKind::Syslog;
    if (name == "stderr")
        return LogKind::Stderr;
    return std::nullopt;
}

ProgramLog::ProgramLog(LogKind kind, int level, std::string identity, std::string syslogSocket) {
    if (kind == LogKind::Syslog)
        _log = std::make_unique<SyslogLog>(std::move(identity), std::move(syslogSocket));
    else
        _log = std::make_unique<StderrLog>();
    setSystemLog(_log.get(), level);
}

ProgramLog::~ProgramLog() {
    setSystemLog(nullptr);
}

} // namespace velmora
