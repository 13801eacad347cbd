// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Samples/WideRows.h"

#include "Tools/Decode/Samples/PositionCells.h"
#include "Tools/Decode/Samples/SampleText.h"
#include "Tools/Output.h"
#include "Tools/Text/CSVText.h"

#include <algorithm>

namespace velmora {

namespace {

bool areSameRow(const Observation& a, const Observation& b) {
    return a.leaf->node->parent() == b.leaf->node->parent()
               ? std::equal(a.rows.begin(), a.rows.end(), b.rows.begin(), b.rows.end())
               : a.rows.empty() && b.rows.empty();
}

} // namespace

WideRows::WideRows(Output& output, bool isLive, const DecodeOptions& options, const std::string& file,
                   SampleColumns& columns)
    : SampleWriter(output, isLive, options, LeafTexts::Form::CSV), _columns(columns),
      _fileCell(csvCellOfFile(file, options.guard)) {}

std::string WideRows::header(const DecodeOptions& options, const SampleColumns& columns) {
    TextBuffer row;
    row.append(csvBeginning(options));
    row.append(",modem_time,code,record");
    if (options.hasPositions)
        row.append(positionColumns);
    if (columns.hasRows())
        row.append(",row");
    for (const SampleColumns::Column& column : columns.columns()) {
        row.append(',');
        appendCsvText(row, column.title, options.guard);
    }
    row.append(csvRowEnd);
    return std::string(row.view());
}

std::string WideRows::textOf(const Decoded& decoded) const {
    return options().hasTechnologyColumn ? "," + decoded.technology : std::string();
}

void WideRows::didMakeDecoder(LogGenerator& decoder) {
    SampleWriter::didMakeDecoder(decoder);
    if (!_columns.columns().empty())
        return;
    // The technology of standard input is known from its first message on.
    _columns.add(options().selection, decoder.catalogue());
    output().put(header(options(), _columns));
}

void WideRows::write(const ObservedMessage& message) {
    const Observation* first = nullptr; // of the current row
    _cells.assign(_columns.columns().size(), nullptr);
    // What is in no list first, in one row.
    for (const bool inLists : {false, true}) {
        for (const Observation& observation : message.observations) {
            if (observation.rows.empty() == inLists)
                continue;
            for (const SelectedLeaves::Choice& choice : technology().selected.of(*observation.leaf)) {
                const std::size_t column =
                    isInRows(observation, choice.rows) ? columnOf(observation, choice) : noColumn;
                if (column == noColumn)
                    continue;
                if (first && (!areSameRow(*first, observation) || _cells[column])) {
                    writeRow(message, *first);
                    first = nullptr;
                }
                if (!first)
                    first = &observation;
                _cells[column] = &observation;
            }
        }
        if (first)
            writeRow(message, *first);
        first = nullptr;
    }
}

void WideRows::writeRow(const ObservedMessage& message, const Observation& first) {
    appendTime(message.arrival);
    line().append(_fileCell);
    line().append(technology().text);
    line().append(',');
    if (const std::optional<Time> own = modemTime(message))
        appendTime(*own);
    line().append(',');
    appendLogCode(line(), message.code);
    line().append(',');
    appendNumber(line(), record());
    if (hasPositions())
        appendPositionCells(line(), position());
    if (_columns.hasRows()) {
        line().append(',');
        if (!first.rowKey.empty())
            appendCsvText(line(), first.rowKey, options().guard);
        else if (!first.rows.empty())
            appendNumber(line(), std::uint64_t{first.rows.back()});
    }
    for (const Observation*& cell : _cells) {
        line().append(',');
        if (cell)
            appendCsvValue(line(), *cell, options().guard);
        cell = nullptr;
    }
    endLine(csvRowEnd);
}

std::size_t WideRows::columnOf(const Observation& observation, const SelectedLeaves::Choice& choice) {
    const std::size_t leaf = observation.leaf->index;
    std::vector<std::vector<std::size_t>>& all = technology().columns;
    while (all.size() <= leaf)
        all.emplace_back();
    std::vector<std::size_t>& columns = all[leaf];
    if (columns.empty()) {
        columns.assign(technology().selected.patterns().size(), noColumn);
        for (std::size_t i = 0; i < _columns.columns().size(); ++i) {
            const SampleColumns::Column& column = _columns.columns()[i];
            if (columns[column.path] == noColumn &&
                (column.leaf.empty() || column.leaf == observation.leaf->path))
                columns[column.path] = i;
        }
    }
    return columns[choice.path];
}

} // namespace velmora
