// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"

namespace velmora {

/// Starts this process's program anew in the same process, with these arguments (the last is null) and the
/// environment as it is. Returns only where that fails. What must not be inherited - ports, displays, files -
/// is closed by then, or closes itself on the start of a program.
[[nodiscard]] Failure restartProcess(char** arguments);

} // namespace velmora
