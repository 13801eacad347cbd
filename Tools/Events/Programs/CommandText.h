// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"

#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// A program and its arguments, as a user writes them in one text: separated by blanks, which '...' and "..."
/// and a backslash before a character keep; inside '...' a backslash is one. Nothing is expanded. Fails for
/// a text without a program, and where a quote or a backslash has nothing that ends it.
[[nodiscard]] Result<std::vector<std::string>> splitCommand(std::string_view text);

} // namespace velmora
