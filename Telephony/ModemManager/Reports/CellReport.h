// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/LiveModem.h"
#include "PropertyLists/Value.h"
#include "Telephony/ModemManager/ModemObjects.h"

#include <string>
#include <vector>

/// The cells of a live modem's message, made of ModemManager's answers.
namespace velmora {

using Dictionaries = std::vector<DictionaryRef>;

/// The cells of an answer of GetCellInfo, of all types. What is no cell is skipped.
[[nodiscard]] Dictionaries cellsOf(const Value& cellInformation);
[[nodiscard]] bool isServing(const Dictionary& cell);
[[nodiscard]] bool hasServingCell(const Dictionaries& cells);
[[nodiscard]] bool hasNeighbor(const Dictionaries& cells);

/// The serving cell that an answer of GetLocation names, by its identity alone; null where it names none. Its
/// technology is that of the modem: where it is on two, the one that it registered on.
[[nodiscard]] DictionaryRef placeOf(const Value& location, const Modem& modem);

/// Gives each serving cell the levels of ModemManager's own polling that it does not have itself, and adds a
/// serving cell that has nothing but these where there is none in the list, and for NR beside LTE: of 5G
/// non-standalone, many modems name the LTE cell alone.
void addServingLevels(Dictionaries& cells, const Modem& modem);

/// Serving cells first, NR after the others; then neighbours by falling level, those without a level last.
void order(Dictionaries& cells);

/// What is known of the cells at one time.
struct CellAnswer {
    ModemCellReport report = ModemCellReport::NotYet;
    std::string reason; ///< why they are not reported, as the bus names it
    Dictionaries cells;
    Value location;                ///< the answer of GetLocation; none where it was not asked
    bool hasSeenNeighbors = false; ///< some answer of this modem's had neighbours
};

/// The message's content.
[[nodiscard]] DictionaryRef cellReportOf(const CellAnswer& answer, const Modem& modem);

} // namespace velmora
