// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Benchmarks/Application/Figures.h"

#include <cstdint>

namespace velmora {

/// The floor: a bare Qt window with a table. `begun_us`: when the process was started, by `now_us`.
[[nodiscard]] Figures bareWindow(int argc, char** argv, std::int64_t begun_us);

/// The application on ports in memory. `hasDrive`: with the drive view beside the panes.
[[nodiscard]] Figures application(int argc, char** argv, std::int64_t begun_us, bool hasDrive);

} // namespace velmora
