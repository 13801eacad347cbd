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

/// Cells that wait to stand for another row, by reuse identifier. The last one in is the first one out.
class CellQueue {
public:
    void add(std::shared_ptr<TableCell> cell);
    /// Null when none waits.
    [[nodiscard]] std::shared_ptr<TableCell> take(std::string_view identifier);
    /// Takes those off the screen that still wait.
    void hideAll();
    /// Lets go of all of them, and takes them out of the widget that they are in.
    void clear();

private:
    std::map<std::string, std::vector<std::shared_ptr<TableCell>>, std::less<>> _waiting;
};

} // namespace velmora
