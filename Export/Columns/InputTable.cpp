// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/InputTable.h"

#include "Export/Columns/DecimalDegrees.h"

#include <utility>

namespace velmora {

TableLayout inputTable(std::string name, std::string_view technology) {
    TableLayout layout = messageTable(std::move(name), technology);
    layout.columns.resize(CommonColumns::file + 1);
    std::erase_if(layout.properties,
                  [](const auto& property) { return property.first.starts_with("velmora.unit."); });
    return layout;
}

InputTable::InputTable(TableLayout layout, std::string file, ByteSink& sink, PageCompressor& compressor)
    : _layout(std::move(layout)), _file(std::move(file)),
      _writer(_layout.columns, _layout.properties, sink, compressor) {}

void InputTable::addRow() {
    if (_writer.isFull())
        if (const Result<Done> written = cut(); !written)
            _failure = Failure{written.reason()};
    _row = _writer.addRow();
}

void InputTable::setNumber(std::size_t column, const std::optional<double>& value, int decimals) {
    if (value)
        setNumber(column, rounded(*value, decimals));
}

void InputTable::setText(std::size_t column, std::string_view value) {
    _writer.column(column).setText(_row, validText(value, _storage));
}

void InputTable::setFile() {
    if (_writer.groupRows() > 0)
        _writer.column(CommonColumns::file).setAllTexts(_writer.groupRows(), _file);
}

Result<Done> InputTable::cut() {
    if (_failure)
        return *_failure;
    setFile();
    return _writer.cut();
}

Result<Done> InputTable::finish() {
    if (_failure)
        return *_failure;
    setFile();
    return _writer.finish();
}

} // namespace velmora
