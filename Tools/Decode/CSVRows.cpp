// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/CSVRows.h"

#include "Tools/Text/CSVText.h"
#include "Tools/Text/JSONText.h"

namespace velmora {

CSVRows::CSVRows(Output& output, bool isLive, const DecodeOptions& options, const std::string& file)
    : LineWriter(output, isLive), _options(options), _ages(options.maximumAge) {
    if (file.empty())
        return;
    TextBuffer cell;
    cell.append(',');
    appendCsvText(cell, file, options.guard);
    _fileCell = cell.view();
}

void CSVRows::willConcern(const Decoded& decoded) {
    if (_options.hasTechnologyColumn)
        _technologyCell = "," + decoded.technology;
}

void CSVRows::didDecode(const LoggedMessage& message, LogGenerator& decoder, Dictionary& state) {
    if (_options.every == DecodeOptions::Every::Message)
        writeRow(message.time, decoder.display(state));
}

void CSVRows::didRefresh(Time tick, const Decoded& decoded) {
    if (_options.every == DecodeOptions::Every::Refresh)
        writeRow(tick, _ages.fresh(decoded, tick));
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

void CSVRows::writeRow(Time moment, const Value& display) {
    appendTime(moment);
    line().append(_fileCell);
    line().append(_technologyCell);
    for (const std::string& path : _options.selection.paths()) {
        line().append(',');
        if (NodeSelection::hasWildcard(path))
            appendAll(display, path);
        else
            appendCsvCell(line(), NodeSelection::find(display, path), _options.guard);
    }
    endLine(csvRowEnd);
}

void CSVRows::appendAll(const Value& display, const std::string& path) {
    _found.clear();
    NodeSelection::findAll(display, path, _found);
    _cell.clear();
    for (const Value* const value : _found) {
        if (_cell.size() > 0)
            _cell.append("; ");
        if (const std::string* const text = value->asString())
            _cell.append(*text);
        else
            appendJson(_cell, *value);
    }
    if (!_found.empty())
        appendCsvText(line(), _cell.view(), _options.guard);
}

} // namespace velmora
