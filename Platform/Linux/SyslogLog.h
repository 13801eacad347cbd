// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/SystemLog.h"

#include <string>

namespace velmora {

/// Lines go to syslog(3) under the program's name. The process has one such connection: one object at a time.
class SyslogLog final : public SystemLog {
public:
    explicit SyslogLog(std::string identity);
    ~SyslogLog() override;
    SyslogLog(const SyslogLog&) = delete;
    SyslogLog& operator=(const SyslogLog&) = delete;

    void write(int priority, std::string_view text) override;

private:
    std::string _identity; ///< syslog keeps a pointer to it
};

} // namespace velmora
