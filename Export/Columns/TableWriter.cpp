// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/TableWriter.h"

namespace velmora {

void TableWriter::addRow(const RowContext& context) {
    if (_writer.isFull())
        if (const Result<Done> written = cut(); !written)
            _failure = Failure{written.reason()};
    _row = _writer.addRow();
    _message = context.message;
    _rows = nullptr;
    column(CommonColumns::message).setInteger(_row, static_cast<std::int64_t>(context.message));
    column(CommonColumns::time).setInteger(_row, context.time);
    if (context.modemTime)
        column(CommonColumns::modemTime).setInteger(_row, *context.modemTime);
    if (context.code)
        column(CommonColumns::code).setInteger(_row, *context.code);
    if (context.place) {
        column(CommonColumns::latitude).setInteger(_row, context.place->latitude);
        column(CommonColumns::longitude).setInteger(_row, context.place->longitude);
    }
}

void TableWriter::addRow(const RowContext& context, std::span<const std::uint32_t> rows,
                         std::string_view rowKey) {
    addRow(context);
    _rows = rows.data();
    for (std::size_t i = 0; i < rows.size(); ++i)
        column(CommonColumns::count + i).setInteger(_row, rows[i]);
    if (!rowKey.empty())
        column(CommonColumns::count + rows.size()).setText(_row, rowKey);
}

void TableWriter::setFile() {
    if (_writer.groupRows() > 0)
        column(CommonColumns::file).setAllTexts(_writer.groupRows(), _file);
    _message = 0;
    _rows = nullptr;
}

Result<Done> TableWriter::cut() {
    if (_failure)
        return *_failure;
    setFile();
    return _writer.cut();
}

Result<Done> TableWriter::finish() {
    if (_failure)
        return *_failure;
    setFile();
    return _writer.finish();
}

} // namespace velmora
