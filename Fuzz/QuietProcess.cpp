// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/QuietProcess.h"

#include "Platform/Console.h"

#include <stdexcept>

namespace velmora {

namespace {

std::FILE* nowhere() {
    std::FILE* stream = std::fopen("/dev/null", "we");
    if (!stream)
        throw std::runtime_error("cannot open /dev/null");
    return stream;
}

} // namespace

QuietProcess::QuietProcess()
    : _earlierLevel(detail::systemLogLevel), _earlierLog(setSystemLog(&_log, LogPriority::Error)),
      _console(nowhere()), _earlierConsole(redirectConsole(_console)) {}

QuietProcess::~QuietProcess() {
    redirectConsole(_earlierConsole);
    std::fclose(_console);
    setSystemLog(_earlierLog, _earlierLevel);
}

} // namespace velmora
