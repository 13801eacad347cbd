// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

#include <termios.h>

namespace velmora {

/// Has the signals by which a program crashes restore the terminal before they end it: what is to be written
/// to standard output and, where it is not null, how standard input is to be set. Both must outlive the
/// program. Called again, it replaces what it was told before; `forget` ends it.
void restoreTerminalOnCrash(std::string_view text, const termios* settings);
void forgetTerminalOnCrash();

} // namespace velmora
