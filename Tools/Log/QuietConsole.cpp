// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Log/QuietConsole.h"

#include "Platform/Console.h"

namespace velmora {

QuietConsole::QuietConsole() : _nowhere(std::fopen("/dev/null", "we")) {
    if (_nowhere)
        _earlier = redirectConsole(_nowhere);
}

QuietConsole::~QuietConsole() {
    if (!_nowhere)
        return;
    redirectConsole(_earlier);
    std::fclose(_nowhere);
}

} // namespace velmora
