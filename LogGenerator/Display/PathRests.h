// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// What is left of paths below a place of the display, which they lead to.
struct PathRests {
    bool isWhole = false;           ///< a path ends here or above: all of it is selected
    std::vector<std::string> rests; ///< of the paths that lead further in; in vain where it is whole

    [[nodiscard]] bool isEmpty() const { return !isWhole && rests.empty(); }
    /// The same of a child of that name. `atRoot`: this is the root.
    [[nodiscard]] PathRests below(std::string_view name, bool atRoot) const;
};

} // namespace velmora
