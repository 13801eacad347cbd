// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/SyslogLog.h"

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/PrintableText.h"

#include <sys/socket.h>
#include <sys/un.h>
#include <syslog.h>

#include <algorithm>
#include <cerrno>
#include <cinttypes>
#include <limits>
#include <utility>

namespace velmora {

namespace {

bool hasListener(const std::string& socket) {
    sockaddr_un address = {};
    if (socket.size() >= sizeof address.sun_path)
        return false;
    address.sun_family = AF_UNIX;
    std::copy(socket.begin(), socket.end(), address.sun_path);
    const FileDescriptor probe(::socket(AF_UNIX, SOCK_DGRAM | SOCK_CLOEXEC, 0));
    return probe &&
           (::connect(probe.get(), reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0 ||
            errno == EPROTOTYPE); // a stream socket, which syslog(3) tries next
}

} // namespace

SyslogLog::SyslogLog(std::string identity, std::string socket)
    : _identity(std::move(identity)), _socket(std::move(socket)) {
    ::openlog(_identity.c_str(), LOG_PID, LOG_USER);
}

SyslogLog::~SyslogLog() {
    ::closelog();
}

void SyslogLog::write(int priority, std::string_view text) {
    if (!isReachable()) {
        ++_discarded;
        return;
    }
    if (const auto discarded = std::exchange(_discarded, 0); discarded > 0)
        ::syslog(LOG_ERR, "%" PRIu64 " log lines were discarded while there was no %s", discarded,
                 _socket.c_str());
    constexpr std::size_t longest = std::numeric_limits<int>::max();
    const std::string line = printableLine(text); // which may say what another program or a file says
    ::syslog(priority & (LOG_PRIMASK | LOG_FACMASK), "%.*s", static_cast<int>(std::min(line.size(), longest)),
             line.data());
}

bool SyslogLog::isReachable() {
    const auto now = std::chrono::steady_clock::now();
    if (!_tried || now - *_tried >= retryInterval) {
        _tried = now;
        _reachable = hasListener(_socket);
    }
    return _reachable;
}

} // namespace velmora
