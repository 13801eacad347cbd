// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/DecimalDegrees.h"
#include "Export/Columns/Parquet/ParquetWriter.h"
#include "Export/Columns/TableLayout.h"

#include <cstdint>
#include <optional>
#include <span>
#include <string>

namespace velmora {

/// The message that rows are of.
struct RowContext {
    std::uint64_t message = 0;
    std::int64_t time = 0;                      ///< in nanoseconds since 1970
    std::optional<std::int64_t> modemTime = {}; ///< the same
    std::optional<std::uint32_t> code = {};
    std::optional<DecimalDegrees> place = {};
};

/// Writes the rows of one table of an input.
class TableWriter {
public:
    /// `file`: the input, as the rows name it. The layout, the sink and the compressor must outlive it.
    TableWriter(const TableLayout& layout, std::string file, ByteSink& sink, PageCompressor& compressor)
        : _layout(layout), _file(std::move(file)),
          _writer(layout.columns, layout.properties, sink, compressor) {}

    [[nodiscard]] const TableLayout& layout() const { return _layout; }
    [[nodiscard]] ColumnBuilder& column(std::size_t index) { return _writer.column(index); }

    /// Begins a row. A full row group is written before; `cut` and `finish` return the reason where that
    /// failed.
    void addRow(const RowContext& context);
    /// The same of a list's entry, with the numbers of the rows that lead to it, as many as the table is
    /// deep.
    void addRow(const RowContext& context, std::span<const std::uint32_t> rows, std::string_view rowKey);
    /// The latest row's number in the row group.
    [[nodiscard]] std::uint32_t row() const { return _row; }
    /// Whether the latest row is one of that message and, by their place in memory, of those rows of lists.
    [[nodiscard]] bool isAt(std::uint64_t message, const std::uint32_t* rows) const {
        return _message == message && _rows == rows;
    }

    [[nodiscard]] std::size_t size() const { return _writer.size(); }
    [[nodiscard]] std::uint64_t rows() const { return _writer.rows(); }
    [[nodiscard]] std::uint64_t bytes() const { return _writer.offset(); }

    /// Writes the rows that are kept. The next row begins another one.
    Result<Done> cut();
    Result<Done> finish();

private:
    void setFile();

    const TableLayout& _layout;
    std::string _file;
    ParquetWriter _writer;
    std::optional<Failure> _failure;
    std::uint32_t _row = 0;
    std::uint64_t _message = 0; ///< of the latest row; 0 for none
    const std::uint32_t* _rows = nullptr;
};

} // namespace velmora
