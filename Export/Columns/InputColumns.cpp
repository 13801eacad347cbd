// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/InputColumns.h"

#include "Export/Columns/FilesTable.h"
#include "Export/Columns/PositionsTable.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

/// After so many messages, or so many bytes of texts, memory is measured again.
constexpr std::uint64_t messagesBetween = 1024;
constexpr std::size_t textBytesBetween = std::size_t{1} << 20;

} // namespace

InputColumns::InputColumns(InputFile file, const RuleSet& rules, TableOutputs& outputs)
    : _file(std::move(file)), _rules(rules), _outputs(outputs) {}

TechnologyTables& InputColumns::add(const Catalogue& catalogue) {
    beginPositions(std::string(catalogue.technology()));
    return *_technologies.emplace_back(
        std::make_unique<TechnologyTables>(catalogue, _rules, _file.hash, _message, _outputs, _compressor));
}

void InputColumns::beginPositions(const std::string& technology) {
    if (_positions)
        return;
    _positions.emplace(positionsTable::layout(technology), _file.hash, _outputs.open("positions", technology),
                       _compressor);
    for (const Fix& fix : std::exchange(_early, {}))
        positionsTable::add(*_positions, fix);
}

void InputColumns::add(const Fix& fix) {
    if (!_positions) {
        _early.push_back(fix);
        return;
    }
    positionsTable::add(*_positions, fix);
    if (_positions->size() > mostOfTable)
        note(_positions->cut());
}

void InputColumns::addNote(std::uint64_t message, std::string_view text) {
    if (_current)
        _current->events().noted(message, text);
}

void InputColumns::addLoss(std::uint64_t message, std::string_view reason) {
    for (const std::unique_ptr<TechnologyTables>& technology : _technologies)
        technology->events().damaged(message, reason);
}

void InputColumns::select(std::string_view technology) {
    endMessage();
    for (const std::unique_ptr<TechnologyTables>& each : _technologies)
        if (each->technology() == technology)
            _current = each.get();
}

void InputColumns::endMessage() {
    if (_current && _message.number != 0 && !_message.isObserved)
        _current->addUndecoded();
    _message.number = 0;
}

void InputColumns::willDecode(const CurrentMessage& message) {
    endMessage();
    const std::size_t textBytes = _message.textBytes;
    _message = message;
    _message.textBytes = textBytes;
    if (++_unchecked < messagesBetween && textBytes < textBytesBetween)
        return;
    _unchecked = 0;
    _message.textBytes = 0;
    limitMemory();
}

void InputColumns::limitMemory() {
    std::size_t sum = limitOthers();
    std::vector<std::pair<std::size_t, TableWriter*>> sizes;
    for (const std::unique_ptr<TechnologyTables>& technology : _technologies)
        for (TableWriter& table : technology->tables()) {
            const std::size_t size = table.size();
            if (size > mostOfTable)
                note(table.cut());
            else
                sum += sizes.emplace_back(size, &table).first;
        }
    if (sum <= mostMemory)
        return;
    std::sort(sizes.begin(), sizes.end(), [](const auto& a, const auto& b) { return a.first > b.first; });
    for (const auto& [size, table] : sizes) {
        note(table->cut());
        sum -= size;
        if (sum <= mostMemory / 2)
            break;
    }
}

/// The same of tables that are not of messages. Returns the bytes of memory that they take.
std::size_t InputColumns::limitOthers() {
    std::size_t sum = _positions ? _positions->size() : 0;
    for (const std::unique_ptr<TechnologyTables>& technology : _technologies) {
        InputTable& events = technology->events().table();
        if (events.size() > mostOfTable)
            note(events.cut());
        sum += events.size();
    }
    return sum;
}

void InputColumns::note(const Result<Done>& result) {
    if (!result && !_failure)
        _failure = Failure{result.reason()};
}

Result<Done> InputColumns::finish(const InputFile& file) {
    endMessage();
    for (const std::unique_ptr<TechnologyTables>& technology : _technologies)
        for (TableWriter& table : technology->tables())
            note(table.finish());
    for (const std::unique_ptr<TechnologyTables>& technology : _technologies)
        note(technology->events().finish());
    if (_positions)
        note(_positions->finish());
    for (const std::unique_ptr<TechnologyTables>& technology : _technologies)
        note(writeFilesTable(file, *technology, _outputs, _compressor));
    if (_failure)
        return *_failure;
    return Done();
}

std::size_t InputColumns::tables() const {
    std::size_t sum = _positions ? 1 : 0;
    for (const std::unique_ptr<TechnologyTables>& technology : _technologies)
        sum += technology->tables().size() + 2; // those of the files and events
    return sum;
}

std::uint64_t InputColumns::rows() const {
    std::uint64_t sum = _positions ? _positions->rows() : 0;
    for (const std::unique_ptr<TechnologyTables>& technology : _technologies) {
        sum += technology->events().rows();
        for (const TableWriter& table : technology->tables())
            sum += table.rows();
    }
    return sum;
}

} // namespace velmora
