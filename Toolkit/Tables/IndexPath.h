// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>

namespace velmora {

/// Names a row of a table: its section and its row within that, both from 0. One made without arguments is
/// null: it names no row. A value.
class IndexPath {
public:
    IndexPath() = default;
    IndexPath(std::size_t section, std::size_t row) : _section(section), _row(row), _isNull(false) {}

    [[nodiscard]] bool isNull() const { return _isNull; }
    /// 0 in a null path.
    [[nodiscard]] std::size_t section() const { return _section; }
    /// The last index. 0 in a null path.
    [[nodiscard]] std::size_t row() const { return _row; }

    friend bool operator==(const IndexPath&, const IndexPath&) = default;

private:
    std::size_t _section = 0;
    std::size_t _row = 0;
    bool _isNull = true;
};

} // namespace velmora
