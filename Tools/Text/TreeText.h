// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Model/VelmoraModelNode.h"

#include <cstddef>
#include <string>
#include <vector>

namespace velmora {

/// A line of the display tree on a terminal. The text is printable, without trailing blanks.
struct TreeRow {
    std::string text;
    bool isBranch = false; ///< an inner node, shown by its name alone
};

/// The rows of a tree in its order: the root's children at column 0, each level indented by two blanks. A
/// leaf shows its name and its value; the values of one parent begin in one column, two blanks after the
/// longest name. The root itself, whose name is the application's, has no row; a root that is a leaf has none
/// at all, as on the screens.
[[nodiscard]] std::vector<TreeRow> treeRows(const VelmoraModelNode& root);

/// The rows as lines of text.
[[nodiscard]] std::string treeText(const VelmoraModelNode& root);

} // namespace velmora
