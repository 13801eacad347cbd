// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Browse/Browser.h"

#include <string>
#include <vector>

namespace velmora {

/// Shows the files on the terminal until the user quits, or a signal ends it. Returns the exit status.
[[nodiscard]] int browseOnTerminal(const std::vector<std::string>& files, const Browser::Open& open);

} // namespace velmora
