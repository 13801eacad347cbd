// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace velmora {

/// The root's path in the display tree.
inline constexpr std::string_view rootNodePath = "/";

/// The path of the child `name` of the node at `path`: "/" and "Serving Cell" give "/Serving Cell", that and
/// "0" give "/Serving Cell/0". A "/" inside a name is not escaped; it adds a level. An empty name gives a
/// path of its own ("//" below the root), never its parent's. The tree builder and the panes share this one
/// function, since a pane finds its node again by its path.
[[nodiscard]] std::string appendingPathComponent(std::string_view path, std::string_view name);

} // namespace velmora
