// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/SearcherSet.h"

#include "LogGenerator/OstrelGSM/UMTS/SearcherRecord.h"
#include "Platform/SystemLog.h"

namespace velmora {

using OstrelGSM::SearcherRecord;

void SearcherSet::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, traceName());
    if (logCode != SearcherRecord::code) {
        unknownLogMessage(logCode);
        return;
    }
    const Record record(data);
    if (record.size() < SearcherRecord::minimumLength)
        return;
    clearElements();
    showCells(record, logCode);
}

void SearcherSet::showCells(const Record& record, std::uint32_t logCode) {
    // Whatever set a cell is of, it gives no row here.
    reportMissingEntries(SearcherRecord(record).cells(), logCode);
}

} // namespace velmora
