// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/OtherFields.h"

#include "Export/Columns/ValidText.h"

namespace velmora {

namespace {

struct Column {
    static constexpr std::size_t path = CommonColumns::count;
    static constexpr std::size_t rowKey = path + 1;
    static constexpr std::size_t number = rowKey + 1;
    static constexpr std::size_t unit = number + 1;
    static constexpr std::size_t raw = unit + 1;
    static constexpr std::size_t text = raw + 1;
    static constexpr std::size_t flag = text + 1;
    static constexpr std::size_t data = flag + 1;
    static constexpr std::size_t shown = data + 1;
};

} // namespace

TableLayout OtherFields::layout(std::string_view technology) {
    TableLayout layout = messageTable("other_fields", technology);
    layout.add("path", StoredType::Text, ValueMeaning::Text);
    layout.add("row_key", StoredType::Text, ValueMeaning::Text);
    layout.add("value_number", StoredType::Number);
    layout.add("value_unit", StoredType::Text, ValueMeaning::Text);
    layout.add("value_raw", StoredType::Integer);
    layout.add("value_text", StoredType::Text, ValueMeaning::Text);
    layout.add("value_flag", StoredType::Boolean);
    layout.add("value_data", StoredType::Text);
    layout.add("shown_text", StoredType::Text, ValueMeaning::Text);
    return layout;
}

void OtherFields::setText(std::size_t column, std::string_view value) {
    _table.column(column).setText(_table.row(), validText(value, _storage));
}

std::size_t OtherFields::add(const RowContext& context, const Observation& observation) {
    _table.addRow(context);
    const std::uint32_t row = _table.row();
    _path.clear();
    observation.appendPath(_path);
    setText(Column::path, _path);
    if (!observation.rowKey.empty())
        setText(Column::rowKey, observation.rowKey);
    switch (observation.kind) {
    case ObservedKind::Number:
        _table.column(Column::number).setNumber(row, observation.number);
        if (observation.leaf->unit != Unit::None)
            setText(Column::unit, nameOf(observation.leaf->unit));
        break;
    case ObservedKind::Enumeration:
        _table.column(Column::raw).setInteger(row, observation.raw);
        setText(Column::text, _text.of(observation));
        break;
    case ObservedKind::Text: setText(Column::text, observation.words); break;
    case ObservedKind::Flag: _table.column(Column::flag).setFlag(row, observation.raw != 0); break;
    case ObservedKind::Binary:
        _table.column(Column::data)
            .setText(row,
                     {reinterpret_cast<const char*>(observation.bytes.data()), observation.bytes.size()});
        break;
    case ObservedKind::Absent: setText(Column::shown, _text.of(observation)); break;
    }
    return _path.size() + observation.words.size() + observation.given.size() + observation.bytes.size();
}

} // namespace velmora
