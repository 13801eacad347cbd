// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "Tools/Decode/Rows/CellWriter.h"
#include "Tools/Decode/Rows/ColumnPlace.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// The cells of a decoder's display, a column for each selected path, kept from row to row: only those are
/// made again whose part of the display records have changed since.
class KeptRow {
public:
    /// `selection` and `decoder` must outlive it.
    KeptRow(const NodeSelection& selection, CSVGuard guard, LogGenerator& decoder)
        : _selection(selection), _decoder(decoder), _cells(guard) {}

    /// The cells of the decoder's display as it is now, each after a comma. Valid until the next call.
    [[nodiscard]] std::string_view cells(Dictionary& state);

private:
    using Mask = std::vector<std::uint64_t>; ///< a bit for each column
    /// A changing place on which columns depend.
    struct Source {
        const std::uint64_t* changes;
        std::uint64_t seen; ///< as of the latest row
        Mask columns;
    };
    struct Column {
        ColumnPlace place;
        std::string_view path;
        bool hasWildcard;
        /// The rest of the path is a row's number, where there is one, and a label, where it is not empty.
        bool hasSteps = false;
        std::optional<std::size_t> row = {};
        std::string_view label = {};
        std::size_t index = 0; ///< of the label's entry, where it was last
    };

    void resolve(const std::vector<ChangingPlace>& places);
    /// Whether any column is stale; sets `_stale`.
    bool findStale();
    void makeStaleCells();
    void appendCell(Column& column);
    /// False where the path does not lead along these steps.
    [[nodiscard]] bool appendBySteps(Column& column, const Value& start);
    static void setSteps(Column& column);

    const NodeSelection& _selection;
    LogGenerator& _decoder;
    CellWriter _cells;
    Value _display;       ///< of which the places have been found
    bool _isKept = false; ///< the places that messages change are known
    std::vector<Source> _sources;
    std::vector<Column> _columns;
    Mask _stale;
    std::string _row;
    std::vector<std::size_t> _ends; ///< of the cells in it
    std::string _next;              ///< the row that is being made, where lengths change
    TextBuffer _cell;
    TextBuffer _fresh; ///< the row where nothing is kept
};

} // namespace velmora
