// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Samples/SampleRows.h"

#include "Tools/Decode/Samples/PositionCells.h"
#include "Tools/Decode/Samples/SampleText.h"
#include "Tools/Text/CSVText.h"

namespace velmora {

SampleRows::SampleRows(Output& output, bool isLive, const DecodeOptions& options, const std::string& file)
    : SampleWriter(output, isLive, options, LeafTexts::Form::CSV),
      _fileCell(csvCellOfFile(file, options.guard)) {}

std::string SampleRows::header(const DecodeOptions& options) {
    return csvBeginning(options) + ",modem_time,path,row,value,unit,text,code,record" +
           std::string(options.hasPositions ? positionColumns : "") + std::string(csvRowEnd);
}

std::string SampleRows::textOf(const Decoded& decoded) const {
    return options().hasTechnologyColumn ? "," + decoded.technology : std::string();
}

void SampleRows::begin(const ObservedMessage& message) {
    appendTime(_head, message.arrival);
    _head.append(_fileCell);
    _head.append(technology().text);
    _head.append(',');
    if (const std::optional<Time> own = modemTime(message))
        appendTime(_head, *own);
    _head.append(',');
    _tail.clear();
    _tail.append(',');
    appendLogCode(_tail, message.code);
    _tail.append(',');
    appendNumber(_tail, record());
    if (hasPositions())
        appendPositionCells(_tail, position());
    _tail.append(csvRowEnd);
}

void SampleRows::write(const ObservedMessage& message) {
    _head.clear();
    for (const Observation& observation : message.observations) {
        const SelectedLeaves::Choice* const choice = technology().selected.of(observation);
        if (!choice)
            continue;
        if (_head.size() == 0)
            begin(message);
        line().append(_head.view());
        technology().leaves.append(line(), observation, choice->path);
        line().append(',');
        if (!observation.rowKey.empty())
            appendCsvText(line(), observation.rowKey, options().guard);
        line().append(',');
        appendCsvValue(line(), observation, options().guard);
        line().append(',');
        if (observation.kind == ObservedKind::Number)
            line().append(nameOf(observation.leaf->unit));
        line().append(',');
        appendCsvText(line(), _text.of(observation), options().guard);
        endLine(_tail.view());
    }
}

} // namespace velmora
