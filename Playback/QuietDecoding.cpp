// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Playback/QuietDecoding.h"

#include "Platform/Console.h"

namespace velmora {

namespace {

/// Opened once; without it the lines go where they went before.
std::FILE* nowhere() {
    static std::FILE* const file = std::fopen("/dev/null", "we");
    return file;
}

} // namespace

QuietDecoding::QuietDecoding()
    : _level(detail::systemLogLevel), _log(setSystemLog(nullptr)),
      _console(nowhere() ? redirectConsole(nowhere()) : nullptr) {}

QuietDecoding::~QuietDecoding() {
    setSystemLog(_log, _level);
    if (_console)
        redirectConsole(_console);
}

} // namespace velmora
