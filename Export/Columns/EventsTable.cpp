// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/EventsTable.h"

#include <array>
#include <charconv>
#include <utility>

namespace velmora {

namespace {

struct Column {
    static constexpr std::size_t time = 1;
    static constexpr std::size_t end = 2;
    static constexpr std::size_t message = 3;
    static constexpr std::size_t lastMessage = 4;
    static constexpr std::size_t kind = 5;
    static constexpr std::size_t severity = 6; ///< and its number
    static constexpr std::size_t text = 8;
    static constexpr std::size_t latitude = 9;
    static constexpr std::size_t longitude = 10;
    static constexpr std::size_t value = 11; ///< a number, its unit, a text
    static constexpr std::size_t others = 14;
    static constexpr std::size_t fields = 15;
};

struct FieldColumn {
    std::string_view field;
    const char* column;
    StoredType type;
};

/// What detectors say of their events.
constexpr std::array fieldColumns = {
    FieldColumn{"duration", "duration_s", StoredType::Number},
    FieldColumn{"cause", "cause_text", StoredType::Text},
    FieldColumn{"from", "from_text", StoredType::Text},
    FieldColumn{"from.technology", "from_technology_text", StoredType::Text},
    FieldColumn{"from.cell", "from_cell", StoredType::Number},
    FieldColumn{"from.channel", "from_channel", StoredType::Number},
    FieldColumn{"from.physical-cell", "from_physical_cell", StoredType::Number},
    FieldColumn{"from.area", "from_area", StoredType::Number},
    FieldColumn{"from.network", "from_network_text", StoredType::Text},
    FieldColumn{"to", "to_text", StoredType::Text},
    FieldColumn{"to.technology", "to_technology_text", StoredType::Text},
    FieldColumn{"to.cell", "to_cell", StoredType::Number},
    FieldColumn{"to.channel", "to_channel", StoredType::Number},
    FieldColumn{"to.physical-cell", "to_physical_cell", StoredType::Number},
    FieldColumn{"to.area", "to_area", StoredType::Number},
    FieldColumn{"to.network", "to_network_text", StoredType::Text},
    FieldColumn{"mode", "mode_text", StoredType::Text},
    FieldColumn{"machine", "machine_text", StoredType::Text},
    FieldColumn{"margin", "margin_db", StoredType::Number},
    FieldColumn{"type", "type_text", StoredType::Text},
    FieldColumn{"outcome", "outcome_text", StoredType::Text},
    FieldColumn{"context", "context_text", StoredType::Text},
    FieldColumn{"address", "address_text", StoredType::Text},
    FieldColumn{"reason", "reason_text", StoredType::Text},
    FieldColumn{"code", "code_text", StoredType::Text},
};

std::string textOf(const EventField::Value& value) {
    if (const auto* const text = std::get_if<std::string>(&value))
        return *text;
    if (const auto* const flag = std::get_if<bool>(&value))
        return *flag ? "true" : "false";
    std::array<char, 32> digits{};
    char* const end =
        std::to_chars(digits.data(), digits.data() + digits.size(), std::get<double>(value)).ptr;
    return {digits.data(), end};
}

} // namespace

TableLayout EventsTable::layout(std::string_view technology) {
    TableLayout layout = inputTable("events", technology);
    const auto addText = [&](const char* name) { layout.add(name, StoredType::Text, ValueMeaning::Text); };
    layout.columns.push_back({{"time", StoredType::Integer, ValueMeaning::Timestamp, false}, true});
    layout.add("end_time", StoredType::Integer, ValueMeaning::Timestamp);
    layout.add("message", StoredType::Integer);
    layout.add("last_message", StoredType::Integer);
    addText("kind_text");
    addText("severity_text");
    layout.add("severity_raw", StoredType::Integer);
    addText("event_text");
    static_cast<void>(addPlace(layout));
    layout.add("value_number", StoredType::Number);
    addText("value_unit");
    addText("value_text");
    addText("other_fields_text");
    for (const FieldColumn& each : fieldColumns)
        layout.add(each.column, each.type,
                   each.type == StoredType::Text ? ValueMeaning::Text : ValueMeaning::Plain);
    return layout;
}

EventsTable::EventsTable(std::string_view technology, std::string file, ByteSink& sink,
                         PageCompressor& compressor)
    : _table(layout(technology), std::move(file), sink, compressor) {}

void EventsTable::add(const Event& event, const std::optional<DecimalDegrees>& place) {
    _table.addRow();
    _table.setInteger(Column::time, event.time.time_since_epoch().count());
    if (event.end)
        _table.setInteger(Column::end, event.end->time_since_epoch().count());
    // What the end of an input or a part that could not be read made has no message.
    if (!event.evidence.empty() && event.evidence.front().number != 0) {
        _table.setInteger(Column::message, static_cast<std::int64_t>(event.evidence.front().number));
        _table.setInteger(Column::lastMessage, static_cast<std::int64_t>(event.evidence.back().number));
    }
    _table.setText(Column::kind, event.kind);
    _table.setText(Column::severity, nameOf(event.severity));
    _table.setInteger(Column::severity + 1, static_cast<std::int64_t>(event.severity));
    _table.setText(Column::text, event.text);
    if (place) {
        _table.setInteger(Column::latitude, place->latitude);
        _table.setInteger(Column::longitude, place->longitude);
    }
    std::string others;
    for (const EventField& field : event.fields)
        if (!set(field))
            others.append(others.empty() ? "" : "; ")
                .append(field.name)
                .append("=")
                .append(textOf(field.value));
    if (!others.empty())
        _table.setText(Column::others, others);
}

bool EventsTable::set(const EventField& field) {
    if (field.name == "value") {
        setValue(field);
        return true;
    }
    for (std::size_t i = 0; i < fieldColumns.size(); ++i) {
        if (fieldColumns[i].field != field.name)
            continue;
        const std::size_t column = Column::fields + i;
        const auto* const number = std::get_if<double>(&field.value);
        const auto* const text = std::get_if<std::string>(&field.value);
        if (number && fieldColumns[i].type == StoredType::Number)
            _table.setNumber(column, *number);
        else if (text && fieldColumns[i].type == StoredType::Text)
            _table.setText(column, *text);
        else
            return false;
        return true;
    }
    return false;
}

void EventsTable::setValue(const EventField& value) {
    if (const auto* const number = std::get_if<double>(&value.value)) {
        _table.setNumber(Column::value, *number);
        if (value.unit != Unit::None)
            _table.setText(Column::value + 1, nameOf(value.unit));
    } else {
        _table.setText(Column::value + 2, textOf(value.value));
    }
}

} // namespace velmora
