// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/SyslogLog.h"

#include "Platform/PrintableText.h"

#include <syslog.h>

#include <algorithm>
#include <limits>
#include <utility>

namespace velmora {

SyslogLog::SyslogLog(std::string identity) : _identity(std::move(identity)) {
    ::openlog(_identity.c_str(), LOG_PID, LOG_USER);
}

SyslogLog::~SyslogLog() {
    ::closelog();
}

void SyslogLog::write(int priority, std::string_view text) {
    constexpr std::size_t longest = std::numeric_limits<int>::max();
    const std::string line = printableLine(text); // which may say what another program or a file says
    ::syslog(priority & (LOG_PRIMASK | LOG_FACMASK), "%.*s", static_cast<int>(std::min(line.size(), longest)),
             line.data());
}

} // namespace velmora
