// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/ActiveSet.h"

#include "LogGenerator/OstrelGSM/UMTS/SearcherRecord.h"

namespace velmora {

using OstrelGSM::SearcherRecord;

namespace {

constexpr std::int64_t activeSet = 0;

DictionaryRef row(const Record& cell, const Record& measurement, int power) {
    const int ecNo = Base::lookUpECNO(SearcherRecord::energy(measurement));
    const int rssi = (power + 512) / 10 - 106; // rounded toward zero
    DictionaryRef result = makeDictionary();
    writeValue(*result, "Scrambling Code", integer("%d"), SearcherRecord::scramblingCode.read(cell));
    // A level, whose unit is shown so all the same.
    writeValue(*result, "RSCP", integer("%d dB"), rssi + ecNo);
    writeValue(*result, "Energy Per Chip", integer("%d dB"), ecNo);
    return result;
}

void fill(Array& rows, const Record& record) {
    const SearcherRecord searcher(record);
    for (std::size_t i = 0; i < searcher.measurements().whole(); ++i)
        if (const Record cell = searcher.cells()[i]; SearcherRecord::setType.read(cell) == activeSet)
            rows.append(row(cell, searcher.measurements()[i], searcher.power()));
}

} // namespace

void ActiveSet::showCells(const Record& record, std::uint32_t logCode) {
    const SearcherRecord searcher(record);
    if (searcher.cells().count() == 0)
        return;
    // The measurements lie behind the cells: one that lies wholly inside the record has its cell there too.
    reportMissingEntries(searcher.measurements(), logCode);
    showElementsWith<fill>(record);
}

} // namespace velmora
