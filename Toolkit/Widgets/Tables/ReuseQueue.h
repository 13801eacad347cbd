// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

class TableCell;

/// Cells that are queued for reuse, by reuse identifier; last in, first out.
class ReuseQueue {
public:
    void add(std::shared_ptr<TableCell> cell);
    /// Null when none waits.
    [[nodiscard]] std::shared_ptr<TableCell> take(std::string_view identifier);
    /// Hides the cells that are still queued.
    void hideAll();
    /// Releases all of them, and removes them from their widget.
    void clear();

private:
    std::map<std::string, std::vector<std::shared_ptr<TableCell>>, std::less<>> _waiting;
};

} // namespace velmora
