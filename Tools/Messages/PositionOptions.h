// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>
#include <string>

namespace CLI {
class App;
class Option;
} // namespace CLI

namespace velmora {

/// Adds `--max-gap`, the longest time between two fixes between which there are positions. `gap` keeps its
/// value without it, and must outlive `command`.
CLI::Option* addMaximumGap(CLI::App& command, std::chrono::nanoseconds& gap);

} // namespace velmora
