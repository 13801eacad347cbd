// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "Analysis/Picture/RadioPicture.h"
#include "Analysis/Statistics/ServingCells.h"
#include "Analysis/Statistics/ValueCounts.h"

#include <chrono>
#include <cstdint>
#include <optional>
#include <vector>

namespace velmora {

/// The serving cells of a technology: how long and how well each served. Cells are those of `stats --by
/// cell`.
class CellRows {
public:
    static constexpr std::size_t mostValues = 512;

    struct Row {
        std::uint64_t visits = 0;
        std::chrono::nanoseconds time{0}; ///< while messages came
        Time first{};
        Time last{};
        MessageNumber firstMessage; ///< that reported it
        MessageNumber lastMessage;  ///< while it served
        ValueCounts levels{mostValues};
        ValueCounts qualities{mostValues};
    };

    /// The message of that time, after `passed` since the one before it; none where messages are missing.
    void report(const MessageReport& report, const RadioPicture& picture, std::chrono::nanoseconds passed);
    /// A value of the message that `report` got last.
    void addLevel(double level_dBm) {
        if (Row* const row = current())
            row->levels.add(level_dBm);
    }
    void addQuality(double quality_dB) {
        if (Row* const row = current())
            row->qualities.add(quality_dB);
    }
    void interrupt() { _number = ServingCells::unknown; }

    [[nodiscard]] std::size_t size() const { return _rows.size(); }
    [[nodiscard]] const Row& row(std::size_t index) const { return _rows[index]; }
    [[nodiscard]] const CellIdentity& identity(std::size_t index) const {
        return _cells.identity(static_cast<std::uint32_t>(index + 1));
    }
    /// The number of the serving cell, from 1; `ServingCells::unknown` or `further` where it has no row.
    [[nodiscard]] std::uint32_t number() const { return _number; }

private:
    [[nodiscard]] Row* current() {
        return _number == ServingCells::unknown || _number == ServingCells::further ? nullptr
                                                                                    : &_rows[_number - 1];
    }

    ServingCells _cells;
    std::vector<Row> _rows; ///< by number
    std::uint32_t _number = ServingCells::unknown;
};

} // namespace velmora
