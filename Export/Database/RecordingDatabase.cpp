// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Database/RecordingDatabase.h"

#include "Export/Database/DatabaseLayout.h"
#include "LogGenerator/Fields/Role.h"
#include "LogGenerator/Fields/Unit.h"

#include <cmath>
#include <type_traits>
#include <variant>

namespace velmora {

namespace {

std::int64_t nanoseconds(Time time) {
    return time.time_since_epoch().count();
}

std::optional<std::int64_t> nanoseconds(const std::optional<Time>& time) {
    return time ? std::optional(nanoseconds(*time)) : std::nullopt;
}

/// A whole number as such, so that channels and cells are no 1300.0.
void addNumber(Insertion& row, double number) {
    constexpr double exact = 9007199254740992; // 2^53
    if (std::trunc(number) == number && std::fabs(number) < exact)
        row.add(static_cast<std::int64_t>(number));
    else
        row.add(number);
}

void addValue(Insertion& row, const Observation& observation) {
    switch (observation.kind) {
    case ObservedKind::Number: addNumber(row, observation.number); break;
    case ObservedKind::Enumeration: row.add(observation.raw); break;
    case ObservedKind::Flag: row.add(std::int64_t{observation.raw != 0}); break;
    case ObservedKind::Text: row.add(observation.words); break;
    case ObservedKind::Binary: row.add(observation.bytes); break;
    case ObservedKind::Absent: row.addNull(); break;
    }
}

void addField(Insertion& row, const EventField* field) {
    if (!field)
        row.addNull();
    else if (const double* const number = std::get_if<double>(&field->value))
        addNumber(row, *number);
    else if (const bool* const flag = std::get_if<bool>(&field->value))
        row.add(std::int64_t{*flag});
    else
        row.add(std::string_view(std::get<std::string>(field->value)));
}

} // namespace

RecordingDatabase::RecordingDatabase(Database& database)
    : _database((database.run(databaseLayout::tables), database)), _messages(database, "messages", 8),
      _samples(database, "samples", 6), _catalogue(database, "catalogue", 9), _events(database, "events", 13),
      _positions(database, "positions", 8) {}

void RecordingDatabase::add(const Message& message) {
    _messages.add(static_cast<std::int64_t>(message.number))
        .add(nanoseconds(message.time))
        .add(nanoseconds(message.modemTime))
        .add(message.technology)
        .add(message.code ? std::optional<std::int64_t>(*message.code) : std::nullopt)
        .addUnlessEmpty(message.damage)
        .addUnlessEmpty(message.channel)
        .addUnlessEmpty(message.cell)
        .done();
}

void RecordingDatabase::add(std::uint64_t message, const std::string& technology,
                            const Observation& observation) {
    _rows.clear();
    for (const std::uint32_t row : observation.rows)
        _rows.append(_rows.empty() ? "" : "/").append(std::to_string(row));
    _samples.add(static_cast<std::int64_t>(message))
        .add(numberOf(technology, *observation.leaf))
        .addUnlessEmpty(_rows)
        .addUnlessEmpty(observation.rowKey);
    addValue(_samples, observation);
    _samples.add(_texts.of(observation)).done();
}

std::int64_t RecordingDatabase::numberOf(const std::string& technology, const CatalogueField& leaf) {
    const auto [found, isNew] = _leaves.try_emplace(&leaf, static_cast<std::int64_t>(_leaves.size()) + 1);
    if (isNew)
        _catalogue.add(found->second)
            .add(std::string_view(technology))
            .add(std::string_view(leaf.path))
            .addUnlessEmpty(leaf.section)
            .add(nameOf(leaf.kind))
            .addUnlessEmpty(nameOf(leaf.unit))
            .addUnlessEmpty(nameOf(leaf.role))
            .addUnlessEmpty(nameOf(leaf.identity))
            .addUnlessEmpty(leaf.clause)
            .done();
    return found->second;
}

void RecordingDatabase::add(const Event& event) {
    _events.add(nanoseconds(event.time))
        .add(event.lasts ? nanoseconds(event.end) : std::nullopt)
        .add(nameOf(event.severity))
        .add(std::string_view(event.kind))
        .add(std::string_view(event.technology))
        .add(std::string_view(event.text));
    for (const char* const name : {"from", "to", "value"})
        addField(_events, event.field(name));
    const EventField* const value = event.field("value");
    _events.addUnlessEmpty(value ? nameOf(value->unit) : std::string_view());
    for (const char* const name : {"cause", "duration"})
        addField(_events, event.field(name));
    if (event.evidence.empty())
        _events.addNull();
    else
        _events.add(static_cast<std::int64_t>(event.evidence.front().number));
    _events.done();
}

void RecordingDatabase::add(const Fix& fix) {
    _positions.add(nanoseconds(fix.time))
        .add(fix.latitude)
        .add(fix.longitude)
        .add(fix.altitude_m)
        .add(fix.speed_mps)
        .add(fix.course_degrees)
        .add(fix.hdop)
        .add(fix.deviation_m)
        .done();
}

void RecordingDatabase::finish() {
    _database.run(databaseLayout::indexes);
    _database.run(databaseLayout::views);
}

} // namespace velmora
