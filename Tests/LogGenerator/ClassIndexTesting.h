// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/ClassIndex.h"
#include "Tests/Support/CapturedLog.h"

#include <cstdint>
#include <functional>
#include <initializer_list>
#include <string>
#include <vector>

/// What the tests of the technologies' class indexes share.

namespace velmora {

/// The names of the sections that want the code, in the order in which they are asked.
[[nodiscard]] std::vector<std::string> subscribers(const ClassIndex& index, std::uint32_t code);

/// Expects of the lines logged while an index was made that each section announced on registration how many
/// codes it wants, and nothing else.
void expectCodeCounts(const CapturedLog& log, std::initializer_list<int> counts);

/// What goes to the console while that runs.
[[nodiscard]] std::string printedBy(const std::function<void()>& run);

} // namespace velmora
