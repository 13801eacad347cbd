// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/TableWriter.h"
#include "LogGenerator/Observations/Observation.h"

#include <string>
#include <string_view>

namespace velmora {

/// The table of what no column is for: fields that messages name themselves, and values of another kind than
/// the field's. A row has the path and the value, whatever its kind, or
/// what is shown where there is none.
class OtherFields {
public:
    [[nodiscard]] static TableLayout layout(std::string_view technology);

    /// The table must outlive it.
    explicit OtherFields(TableWriter& table) : _table(table) {}

    /// Adds a row. Returns the bytes of its texts.
    std::size_t add(const RowContext& context, const Observation& observation);

private:
    void setText(std::size_t column, std::string_view text);

    TableWriter& _table;
    ObservedText _text;
    std::string _path;
    std::string _storage;
};

} // namespace velmora
