// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/InputColumns.h"

#include "Export/Columns/FilesTable.h"

#include <algorithm>

namespace velmora {

namespace {

/// After so many messages, or so many bytes of texts, memory is measured again.
constexpr std::uint64_t messagesBetween = 1024;
constexpr std::size_t textBytesBetween = std::size_t{1} << 20;

} // namespace

InputColumns::InputColumns(InputFile file, TableOutputs& outputs)
    : _file(std::move(file)), _outputs(outputs) {}

TechnologyTables& InputColumns::add(const Catalogue& catalogue) {
    return *_technologies.emplace_back(
        std::make_unique<TechnologyTables>(catalogue, _file.hash, _message, _outputs, _compressor));
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
    std::size_t sum = 0;
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
        note(writeFilesTable(file, *technology, _outputs, _compressor));
    if (_failure)
        return *_failure;
    return Done();
}

std::size_t InputColumns::tables() const {
    std::size_t sum = 0;
    for (const std::unique_ptr<TechnologyTables>& technology : _technologies)
        sum += technology->tables().size() + 1; // that of the files
    return sum;
}

std::uint64_t InputColumns::rows() const {
    std::uint64_t sum = 0;
    for (const std::unique_ptr<TechnologyTables>& technology : _technologies)
        for (const TableWriter& table : technology->tables())
            sum += table.rows();
    return sum;
}

} // namespace velmora
