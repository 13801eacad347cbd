// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/CSVRows.h"

#include "Tools/Text/CSVText.h"

namespace velmora {

CSVRows::CSVRows(Output& output, bool isLive, const DecodeOptions& options, const std::string& file)
    : LineWriter(output, isLive), _options(options) {
    if (file.empty())
        return;
    TextBuffer cell;
    cell.append(',');
    appendCsvText(cell, file);
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
        writeRow(tick, decoded.display);
    LineWriter::didRefresh(tick, decoded);
}

std::string CSVRows::header(const DecodeOptions& options) {
    TextBuffer row;
    row.append(options.files.size() > 1 ? "time,file" : "time");
    if (options.hasTechnologyColumn)
        row.append(",technology");
    for (const std::string& path : options.selection.paths()) {
        row.append(',');
        appendCsvText(row, path);
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
        appendCsvCell(line(), NodeSelection::find(display, path));
    }
    endLine(csvRowEnd);
}

} // namespace velmora
