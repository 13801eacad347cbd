// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

namespace velmora {

/// What the keys do, a line each, for the screen.
[[nodiscard]] std::vector<std::string> browseHelp();

} // namespace velmora
