// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/CSVRows.h"

#include "Tools/Text/CSVText.h"

namespace velmora {

CSVRows::CSVRows(Output& output, bool isLive, const DecodeOptions& options, const std::string& file)
    : LineWriter(output, isLive), _options(options), _ages(options.maximumAge), _cells(options.guard) {
    if (file.empty())
        return;
    TextBuffer cell;
    cell.append(',');
    appendCsvText(cell, file, options.guard);
    _fileCell = cell.view();
}

void CSVRows::didMakeDecoder(LogGenerator& decoder) {
    _ages.watch(decoder);
    _options.selection.limit(decoder);
    if (_options.every == DecodeOptions::Every::Message)
        _keptRows.try_emplace(&decoder, _options.selection, _options.guard, decoder);
}

void CSVRows::willConcern(const Decoded& decoded) {
    if (_options.hasTechnologyColumn)
        _technologyCell = "," + decoded.technology;
}

void CSVRows::didDecode(const LoggedMessage& message, LogGenerator& decoder, Dictionary& state) {
    if (_options.every != DecodeOptions::Every::Message)
        return;
    beginRow(message.time);
    line().append(_keptRows.at(&decoder).cells(state));
    endLine(csvRowEnd);
}

void CSVRows::didRefresh(Time tick, const Decoded& decoded) {
    if (_options.every == DecodeOptions::Every::Refresh) {
        beginRow(tick);
        _cells.appendAll(line(), _ages.fresh(decoded, tick), _options.selection);
        endLine(csvRowEnd);
    }
    LineWriter::didRefresh(tick, decoded);
}

std::string CSVRows::header(const DecodeOptions& options) {
    TextBuffer row;
    row.append(options.files.size() > 1 ? "time,file" : "time");
    if (options.hasTechnologyColumn)
        row.append(",technology");
    for (const std::string& name : options.selection.names()) {
        row.append(',');
        appendCsvText(row, name, options.guard);
    }
    row.append(csvRowEnd);
    return std::string(row.view());
}

void CSVRows::beginRow(Time moment) {
    appendTime(moment);
    line().append(_fileCell);
    line().append(_technologyCell);
}

} // namespace velmora
