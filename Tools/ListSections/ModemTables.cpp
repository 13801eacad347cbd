// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/ListSections/ModemTables.h"

#include "LogGenerator/Modem/Cells/CellTable.h"
#include "LogGenerator/Modem/ModemStatus.h"
#include "LogGenerator/Modem/Values/Masks.h"
#include "LogMessages/LiveModem.h"
#include "Tools/ListSections/CarrierRuns.h"
#include "Tools/ListSections/LuaText.h"

#include <functional>
#include <optional>
#include <stdexcept>

namespace velmora {

namespace {

using namespace LiveModem;

using TextOfNumber = std::function<std::optional<std::string>(std::int64_t)>;

constexpr std::int64_t largestNumber = 0x7FFFFFFE;
constexpr std::int64_t mostTexts = 32; // more than any of ModemManager's enumerations has

/// What is said of a modem that reports this number and nothing else.
TextOfNumber statusBy(std::string_view key, std::optional<std::string> (*status)(const Dictionary&),
                      std::int64_t state = 0) {
    return [=](std::int64_t number) {
        Dictionary message;
        message.set(kVoxModemState, Value(state));
        message.set(key, Value(number));
        return status(message);
    };
}

/// The texts of numbers, and as "other" the form of those that have none.
std::string statusTexts(std::string_view name, const TextOfNumber& textOf) {
    std::string other = textOf(largestNumber).value();
    const std::string digits = std::to_string(largestNumber);
    const std::size_t at = other.find(digits);
    if (at == std::string::npos)
        throw std::runtime_error("no number in " + other);
    const auto otherOf = [&](std::int64_t number) {
        return other.substr(0, at) + std::to_string(number) + other.substr(at + digits.size());
    };
    std::string table = "    " + std::string(name) + "={";
    for (std::int64_t number = 0; number < mostTexts; ++number)
        if (const auto text = textOf(number); text && *text != otherOf(number))
            table += "[" + std::to_string(number) + "]=" + luaString(*text) + ",";
    return table + "other=" + luaString(other.replace(at, digits.size(), "%d")) + "},\n";
}

/// The names of a mask's bits.
std::string maskTexts(std::string_view key, std::optional<std::string> (*textOf)(const Value&)) {
    std::string table = "    " + std::string(key) + "={";
    for (unsigned bit = 0; bit < 32; ++bit) {
        const std::string text = textOf(Value(std::int64_t{1} << bit)).value();
        if (!text.starts_with("0x"))
            table += "[" + std::to_string(bit) + "]=" + luaString(text) + ",";
    }
    return table + "},\n";
}

/// The rows of a cell: label, technologies, whether a place has it, key and range. Those of all kinds of
/// cells are the same but for their roles.
std::string cellRowTexts() {
    std::string table = "    rows={\n";
    for (const CellRow& row : servingCellRows()) {
        table += "        {l=" + luaString(row.field.label) + ",radios=" + std::to_string(row.technologies);
        if (row.isOfPlace)
            table += ",place=true";
        if (!row.key.empty())
            table += ",key=" + luaString(row.key);
        if (row.range.least != Range().least)
            table += ",least=" + luaNumber(row.range.least) + ",most=" + luaNumber(row.range.most);
        table += "},\n";
    }
    return table + "    },\n";
}

} // namespace

std::string modemTables() {
    const auto working = [](const Dictionary& message) { return std::optional(workingState(message)); };
    constexpr std::int64_t failed = -1;
    return statusTexts("presences", statusBy(kVoxModemPresence, troubleOf)) +
           statusTexts("failures", statusBy(kVoxModemFailedReason, troubleOf, failed)) +
           statusTexts("locks", statusBy(kVoxModemLock, troubleOf)) +
           statusTexts("states", statusBy(kVoxModemState, working)) +
           statusTexts("cellReports", statusBy(kVoxModemCellReport, cellTrouble)) +
           statusTexts("neighborReports", statusBy(kVoxModemNeighborReport, neighborTrouble)) +
           maskTexts(kVoxLinkAccessTechnologies, accessTechnologies) +
           maskTexts(kVoxModemCapabilities, capabilities) + maskTexts(kVoxContextIPFamily, addressFamilies) +
           cellRowTexts() + carrierRuns();
}

} // namespace velmora
