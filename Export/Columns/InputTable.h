// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/ParquetWriter.h"
#include "Export/Columns/TableLayout.h"
#include "Export/Columns/ValidText.h"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// Writes the rows of a table of an input that are of no message, whatever its columns: the first one names
/// the input.
class InputTable {
public:
    /// `file`: the input, as the rows name it. Sink and compressor must outlive it.
    InputTable(TableLayout layout, std::string file, ByteSink& sink, PageCompressor& compressor);

    /// Begins a row. A full row group is written before; `cut` and `finish` return the reason where that
    /// failed.
    void addRow();
    // Of the latest row, each column once.
    void setInteger(std::size_t column, std::int64_t value) {
        _writer.column(column).setInteger(_row, value);
    }
    void setNumber(std::size_t column, double value) { _writer.column(column).setNumber(_row, value); }
    void setNumber(std::size_t column, const std::optional<double>& value, int decimals);
    void setText(std::size_t column, std::string_view value);

    [[nodiscard]] std::size_t size() const { return _writer.size(); }
    [[nodiscard]] std::uint64_t rows() const { return _writer.rows(); }

    /// Writes the rows that are kept.
    Result<Done> cut();
    Result<Done> finish();

private:
    void setFile();

    TableLayout _layout;
    std::string _file;
    ParquetWriter _writer;
    std::optional<Failure> _failure;
    std::uint32_t _row = 0;
    std::string _storage;
};

/// Such a table with nothing but the name of the input.
[[nodiscard]] TableLayout inputTable(std::string name, std::string_view technology);

} // namespace velmora
