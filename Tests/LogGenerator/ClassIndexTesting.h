// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <string>

/// What the tests of the class indexes share.

namespace velmora {

/// What goes to the console while that runs.
[[nodiscard]] std::string printedBy(const std::function<void()>& run);

} // namespace velmora
