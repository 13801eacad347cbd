// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"
#include "Tools/Decode/Paths/NodeSelection.h"
#include "Tools/Text/CSVText.h"
#include "Tools/Text/TextBuffer.h"

#include <string_view>
#include <vector>

namespace velmora {

/// Writes the cells of paths in a display: nothing where a path leads to nothing; of a path with "*" all
/// values, with "; " between them. Once it has written the longest cell it allocates nothing.
class CellWriter {
public:
    explicit CellWriter(CSVGuard guard) : _guard(guard) {}

    /// The cell of a whole path.
    void append(TextBuffer& out, const Value& display, std::string_view path);
    /// The cell of what is left of a path below a place, whose value that is. `rest`: not empty.
    void appendBelow(TextBuffer& out, const Value& place, std::string_view rest, bool hasWildcard);
    /// The cell of a value.
    void append(TextBuffer& out, const Value* value);
    /// A row's cells, each after a comma.
    void appendAll(TextBuffer& out, const Value& display, const NodeSelection& selection);

private:
    void appendFound(TextBuffer& out);

    CSVGuard _guard;
    std::vector<const Value*> _found;
    TextBuffer _text;
};

} // namespace velmora
