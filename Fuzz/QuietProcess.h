// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/SystemLog.h"

#include <cstdio>

namespace velmora {

/// During its lifetime the process's log lines of error priority are formatted, since they use the input, and
/// discarded, as is what classes print on the console. Main thread only.
class QuietProcess {
public:
    QuietProcess();
    ~QuietProcess();
    QuietProcess(const QuietProcess&) = delete;
    QuietProcess& operator=(const QuietProcess&) = delete;

private:
    class NullLog final : public SystemLog {
    public:
        void write(int, std::string_view) override {}
    };

    NullLog _log;
    int _earlierLevel;
    SystemLog* _earlierLog;
    std::FILE* _console;
    std::FILE* _earlierConsole;
};

} // namespace velmora
