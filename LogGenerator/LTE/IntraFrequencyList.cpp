// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/IntraFrequencyList.h"

#include "Platform/SystemLog.h"

namespace velmora {

using LTE::IntraFrequencyRecord;

void IntraFrequencyList::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, getSectionName());
    if (logCode != IntraFrequencyRecord::code) {
        unknownLogMessage(logCode);
        return;
    }
    const Record record(data);
    if (record.size() < IntraFrequencyRecord::minimumLength)
        return;
    const IntraFrequencyRecord measurement(record);
    showRows((measurement.*_cells)(), _cell, logCode);
}

} // namespace velmora
