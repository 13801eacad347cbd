// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Text/TreeText.h"

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

enum class SearchDirection : bool { Forward, Backward };

/// The next row after that one, or before it, that has the text; letters of ASCII match in either case.
[[nodiscard]] std::optional<std::size_t> findRow(const std::vector<TreeRow>& rows, const std::string& text,
                                                 std::size_t from, SearchDirection direction);
/// The same for a row that is a branch.
[[nodiscard]] std::optional<std::size_t> findBranch(const std::vector<TreeRow>& rows, std::size_t from,
                                                    SearchDirection direction);
/// The rows that have the text, with the branches that they are in and all that is in branches that have it;
/// all rows for an empty text.
[[nodiscard]] std::vector<TreeRow> rowsWith(const std::vector<TreeRow>& rows, const std::string& text);

} // namespace velmora
