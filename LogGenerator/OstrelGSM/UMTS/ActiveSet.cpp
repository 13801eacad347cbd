// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/ActiveSet.h"

#include "LogGenerator/OstrelGSM/UMTS/SearcherRecord.h"

namespace velmora {

using OstrelGSM::SearcherRecord;

namespace {

constexpr std::int64_t activeSet = 0;

// Primary scrambling code (3GPP TS 25.213 5.2.2), CPICH RSCP and Ec/No (quantities of TS 25.215), both
// computed from the modem's own scales.
constexpr Field scramblingCode{"Scrambling Code",
                               SearcherRecord::scramblingCode,
                               integer("%d"),
                               {.role = Role::ServingPhysicalCell, .clause = "3GPP TS 25.213 5.2.2"}};
// A level, shown in dB on purpose.
constexpr Field codePower{"RSCP",
                          computed,
                          integer("%d dB"),
                          {.role = Role::ServingLevel, .unit = Unit::DBm, .clause = "3GPP TS 25.215 5.1.1"}};
constexpr Field energyPerChip{"Energy Per Chip",
                              computed,
                              integer("%d dB"),
                              {.role = Role::ServingQuality, .clause = "3GPP TS 25.215 5.1.5"}};

constexpr Content contents[] = {scramblingCode, codePower, energyPerChip};

constexpr View sectionViews[] = {{SearcherRecord::code, SearcherRecord::minimumLength}};

} // namespace

std::span<const Content> ActiveSet::cellContents() const {
    return contents;
}

std::span<const View> ActiveSet::views() const {
    return sectionViews;
}

void ActiveSet::checkCells(const Record& record) const {
    // The measurements follow the cells: a complete one has its cell inside the record too.
    reportMissingEntries(SearcherRecord(record).measurements(), SearcherRecord::code);
}

void ActiveSet::visitCells(const Record& record, FieldVisitor& visitor) const {
    const SearcherRecord searcher(record);
    const int rssi = (searcher.power() + 512) / 10 - 106; // rounded toward zero
    for (std::size_t i = 0; i < searcher.measurements().completeCount(); ++i) {
        const Record cell = searcher.cells()[i];
        if (SearcherRecord::setType.read(cell) != activeSet)
            continue;
        const int ecNo = lookUpECNO(SearcherRecord::energy(searcher.measurements()[i]));
        visitor.beginRow();
        visitor.number(scramblingCode, scramblingCode.place.read(cell));
        visitor.number(codePower, rssi + ecNo);
        visitor.number(energyPerChip, ecNo);
        visitor.endRow();
    }
}

} // namespace velmora
