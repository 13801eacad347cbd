// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

/// The program `velmora-log`: all that its `main` does. Returns the exit status.
[[nodiscard]] int runVelmoraLog(int count, const char* const* arguments);

} // namespace velmora
