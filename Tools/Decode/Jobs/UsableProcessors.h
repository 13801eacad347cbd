// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>

namespace velmora {

/// How many processors this process may run on, at least 1: not all of the machine's where it was started
/// with fewer (taskset, a container's set of processors).
[[nodiscard]] std::size_t usableProcessors();

} // namespace velmora
