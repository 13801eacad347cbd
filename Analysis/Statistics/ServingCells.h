// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/CellIdentity.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace velmora {

class RadioPicture;

/// The serving cells of a technology, numbered in the order of their first messages. A cell is often reported
/// bit by bit, the channel in one record and the scrambling code in another: what is learned of it while it
/// serves is added to what is known, so that it is recognised by any of it later.
class ServingCells {
public:
    static constexpr std::uint32_t unknown = 0;
    /// All cells beyond the first `mostCells`.
    static constexpr std::uint32_t further = ~std::uint32_t{0};
    static constexpr std::size_t mostCells = 1024;

    /// The number of the serving cell, from 1, after each message.
    [[nodiscard]] std::uint32_t numberOf(const RadioPicture& picture);
    /// What is known of a cell. Precondition: it is neither of the two above.
    [[nodiscard]] const CellIdentity& identity(std::uint32_t number) const { return _cells[number - 1]; }

private:
    [[nodiscard]] std::uint32_t find(const CellIdentity& cell);

    std::vector<CellIdentity> _cells;
    CellIdentity _latest;
    std::uint32_t _number = unknown; ///< of the latest one
};

} // namespace velmora
