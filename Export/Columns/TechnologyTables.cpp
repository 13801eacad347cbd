// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/TechnologyTables.h"

#include "Export/Columns/ValidText.h"
#include "LogMessages/RecordTime.h"

#include <chrono>

namespace velmora {

namespace {

constexpr std::size_t sizeColumn = CommonColumns::count;
constexpr std::size_t decodedColumn = sizeColumn + 1;
constexpr std::size_t positionColumn = decodedColumn + 1;

TableLayout messageLayout(std::string_view technology) {
    TableLayout layout = messageTable("messages", technology);
    layout.add("size_byte", StoredType::Integer);
    layout.add("decoded_flag", StoredType::Boolean);
    for (const char* const name : {"altitude_m", "speed_m_s", "fix_age_s", "hdop", "deviation_m"})
        layout.add(name, StoredType::Number);
    return layout;
}

/// As many decimals as `decode --positions` shows.
void setPosition(TableWriter& table, const Position& position) {
    const double age = std::chrono::duration<double>(position.age).count();
    const Fix& fix = position.fix;
    std::size_t column = positionColumn;
    const auto set = [&](const std::optional<double>& value, int decimals) {
        if (value)
            table.column(column).setNumber(table.row(), rounded(*value, decimals));
        ++column;
    };
    set(fix.altitude_m, 2);
    set(fix.speed_mps, 2);
    set(age, 3);
    set(fix.hdop, 2);
    set(fix.deviation_m, 2);
}

} // namespace

TechnologyTables::TechnologyTables(const Catalogue& catalogue, const RuleSet& rules, const std::string& file,
                                   CurrentMessage& message, TableOutputs& outputs, PageCompressor& compressor)
    : _technology(catalogue.technology()), _layout(catalogue), _message(message),
      _events(catalogue, rules, file, outputs.open("events", _technology), compressor) {
    _layout.tables.push_back(messageLayout(_technology));
    _layout.tables.push_back(OtherFields::layout(_technology));
    for (const TableLayout& layout : _layout.tables)
        _tables.emplace_back(layout, file, outputs.open(layout.name, _technology), compressor);
    _others.emplace(_tables.back());
    _messages = &_tables[_tables.size() - 2];
}

RowContext TechnologyTables::contextOf(const ObservedMessage& message) const {
    RowContext context{_message.number, _message.arrival.time_since_epoch().count()};
    context.code = message.code;
    if (message.timestamp && isRecordTime(*message.timestamp))
        if (const std::optional<Time> own = timeOfRecord(*message.timestamp))
            context.modemTime = own->time_since_epoch().count();
    if (_message.position)
        context.place = decimalDegreesOf(_message.position->fix);
    return context;
}

void TechnologyTables::addMessage(const RowContext& context, bool isDecoded) {
    _messages->addRow(context);
    _messages->column(sizeColumn).setInteger(_messages->row(), static_cast<std::int64_t>(_message.size));
    _messages->column(decodedColumn).setFlag(_messages->row(), isDecoded);
    if (_message.position)
        setPosition(*_messages, *_message.position);
    ++_summary.messages;
    _summary.undecoded += isDecoded ? 0 : 1;
    if (!_summary.first)
        _summary.first = _message.arrival;
    _summary.last = _message.arrival;
}

void TechnologyTables::addUndecoded() {
    ObservedMessage nothing{};
    nothing.number = _message.number;
    nothing.arrival = _message.arrival;
    nothing.damage = Damage::Unreadable;
    const RowContext context = contextOf(nothing);
    addMessage(context, false);
    _events.report(nothing, _message.number, context.place);
}

void TechnologyTables::observed(const ObservedMessage& message) {
    if (_message.number == 0 || _message.isObserved)
        return;
    _message.isObserved = true;
    const RowContext context = contextOf(message);
    addMessage(context, true);
    for (const Observation& observation : message.observations)
        add(context, observation);
    _events.report(message, _message.number, context.place);
}

void TechnologyTables::add(const RowContext& context, const Observation& observation) {
    const std::size_t leaf = observation.leaf->index;
    const LeafColumn place = leaf < _layout.leaves.size() ? _layout.leaves[leaf] : LeafColumn();
    const bool isAbsent = observation.kind == ObservedKind::Absent;
    // Why a field without values has none is no value either.
    if (place.table == LeafColumn::none && isAbsent && observation.leaf->kind == ObservedKind::Absent)
        return;
    if (place.table == LeafColumn::none || (!isAbsent && observation.kind != observation.leaf->kind)) {
        _message.textBytes += _others->add(context, observation);
        return;
    }
    TableWriter& table = _tables[place.table];
    if (!table.isAt(context.message, observation.rows.data()) ||
        table.column(place.column).hasRow(table.row())) {
        if (table.layout().depth > 0)
            table.addRow(context, observation.rows, observation.rowKey);
        else
            table.addRow(context);
    }
    set(table, place.column, observation);
}

void TechnologyTables::set(TableWriter& table, std::size_t column, const Observation& observation) {
    const std::uint32_t row = table.row();
    switch (observation.kind) {
    case ObservedKind::Number: table.column(column).setNumber(row, observation.number); break;
    case ObservedKind::Enumeration:
        setEnumeration(table.column(column), row, observation);
        table.column(column + 1).setInteger(row, observation.raw);
        break;
    case ObservedKind::Text: setText(table, column, observation.words); break;
    case ObservedKind::Flag: table.column(column).setFlag(row, observation.raw != 0); break;
    case ObservedKind::Binary:
        _message.textBytes += observation.bytes.size();
        table.column(column).setText(
            row, {reinterpret_cast<const char*>(observation.bytes.data()), observation.bytes.size()});
        break;
    case ObservedKind::Absent: break;
    }
}

/// The text of a raw number is made once, and looked up by the number: most are of a few.
void TechnologyTables::setEnumeration(ColumnBuilder& column, std::uint32_t row,
                                      const Observation& observation) {
    const bool isOfRaw = observation.text == Observation::Text::OfRaw && observation.source;
    const ColumnBuilder::TextSource source{isOfRaw ? &observation.source->field->format : nullptr,
                                           observation.raw};
    if (isOfRaw)
        if (const std::optional<std::size_t> size = column.setTextOf(row, source)) {
            _message.textBytes += *size;
            return;
        }
    const std::string_view text = _text.of(observation);
    _message.textBytes += text.size();
    if (isOfRaw)
        column.setText(row, validText(text, _storage), source, text.size());
    else
        column.setText(row, validText(text, _storage));
}

void TechnologyTables::setText(TableWriter& table, std::size_t column, std::string_view text) {
    _message.textBytes += text.size();
    table.column(column).setText(table.row(), validText(text, _storage));
}

} // namespace velmora
