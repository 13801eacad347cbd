// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"
#include "Telephony/ModemManager/ModemObjects.h"

#include <string>
#include <string_view>
#include <vector>

/// The extra stream's records of a modem, built from ModemManager's data. The member table decides what is in
/// them.
namespace velmora {

/// The modem's log technology: that of its access technology or, before its first registration, of its best
/// capability. Empty where the live display supports neither.
[[nodiscard]] std::string_view technologyOf(const Modem& modem);
/// The same of its access technology alone.
[[nodiscard]] std::string_view accessTechnologyOf(const Modem& modem);

/// More cells and bearers than any modem has; further ones are skipped.
inline constexpr std::size_t maximumCells = 64;
inline constexpr std::size_t maximumBearers = 8;

using Dictionaries = std::vector<DictionaryRef>;

/// The cells of an answer of GetCellInfo. The modem adds the levels of the serving cell.
[[nodiscard]] Dictionaries cellsOf(const Value& cellInformation, const Modem& modem);
[[nodiscard]] bool hasServingCell(const Dictionaries& cells);
/// The serving cell that an answer of GetLocation names; null where it names none. Its technology is the
/// modem's.
[[nodiscard]] DictionaryRef servingCellFromLocation(const Value& location, const Modem& modem);

/// The SIM's files; `sim` are the properties of the SIM object.
[[nodiscard]] DictionaryRef simFilesOf(const Modem& modem, const Dictionary& sim);

/// A bearer object's number and properties.
struct ModemBearer {
    std::string path;
    DictionaryRef properties;
};
/// The display values of each bearer and of the link under it; of the link alone where there is no bearer, so
/// that a modem without one still shows its registration and its signal.
[[nodiscard]] Dictionaries contextsOf(const Modem& modem, const std::vector<ModemBearer>& bearers);

} // namespace velmora
