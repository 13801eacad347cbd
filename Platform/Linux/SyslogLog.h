// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/SystemLog.h"

#include <chrono>
#include <cstdint>
#include <optional>
#include <string>

namespace velmora {

/// Lines go to syslog(3) under the program's name. The process has one such connection: one object at a time.
///
/// Without a log daemon syslog(3) tries to connect with every line, which costs more than the line. So the
/// socket is tried here at most once a second, and while it is missing lines are counted and discarded; their
/// number is a line once it is there.
class SyslogLog final : public SystemLog {
public:
    /// `socket` is the daemon's, which syslog(3) connects to; tests name another.
    explicit SyslogLog(std::string identity, std::string socket = standardSocket);
    ~SyslogLog() override;
    SyslogLog(const SyslogLog&) = delete;
    SyslogLog& operator=(const SyslogLog&) = delete;

    void write(int priority, std::string_view text) override;

    static constexpr const char* standardSocket = "/dev/log";
    static constexpr std::chrono::seconds retryInterval{1};

private:
    /// Whether the socket was there when it was last tried, which was within the interval.
    [[nodiscard]] bool isReachable();

    std::string _identity; ///< syslog keeps a pointer to it
    std::string _socket;
    std::optional<std::chrono::steady_clock::time_point> _tried;
    bool _reachable = false;
    std::uint64_t _discarded = 0;
};

} // namespace velmora
