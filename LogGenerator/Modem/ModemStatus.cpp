// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/ModemStatus.h"

#include "LogGenerator/Fields/TextFormat.h"
#include "LogGenerator/Modem/Values/Enumerations.h"
#include "LogGenerator/Modem/Values/TypedValue.h"
#include "LogMessages/LiveModem.h"

namespace velmora::LiveModem {

namespace {

constexpr std::int64_t failedState = -1;
constexpr Range modemStateRange{-1, 0x7FFFFFFE};
constexpr Range failureRange{1, 0x7FFFFFFE}; // 0: none
constexpr Range lockRange{2, 0x7FFFFFFE};    // 0: unknown, 1: none

constexpr EnumText presenceRows[] = {
    {static_cast<std::uint32_t>(ModemPresence::NoBus), "No system bus"},
    {static_cast<std::uint32_t>(ModemPresence::NoManager), "ModemManager is not running"},
    {static_cast<std::uint32_t>(ModemPresence::NoPermission), "No permission to see the modems"},
    {static_cast<std::uint32_t>(ModemPresence::NoModem), "No modem"},
    {static_cast<std::uint32_t>(ModemPresence::NotTheOne), "The chosen modem is not there"},
    {static_cast<std::uint32_t>(ModemPresence::NoAnswer), "ModemManager does not answer"},
};
constexpr EnumTexts presences(presenceRows, "No modem (", ")");

constexpr EnumText reportRows[] = {
    {static_cast<std::uint32_t>(ModemCellReport::Unsupported), "not reported: not supported by this modem"},
    {static_cast<std::uint32_t>(ModemCellReport::NoPermission),
     "not reported: no permission (Documentation/live-modem.md has the bus policy)"},
    {static_cast<std::uint32_t>(ModemCellReport::Failing), "not reported: the query fails"},
    {static_cast<std::uint32_t>(ModemCellReport::NotYet), "not reported yet"},
};
constexpr EnumTexts reports(reportRows, "not reported (", ")");

std::string enumerationText(const EnumTexts& texts, std::int64_t number) {
    TextFormat format;
    format.kind = TextFormat::Kind::Enumeration;
    format.texts = &texts;
    return std::string(FormattedText(format, number).view());
}

std::int64_t numberOrZero(const Dictionary& message, std::string_view key, const Range& range) {
    return wholeNumberOf(message[key], range).value_or(0);
}

} // namespace

bool isModemAbsent(const Dictionary& message) {
    return numberOrZero(message, kVoxModemPresence, failureRange) !=
           static_cast<std::int64_t>(ModemPresence::Present);
}

std::optional<std::string> troubleOf(const Dictionary& message) {
    if (isModemAbsent(message))
        return enumerationText(presences, numberOrZero(message, kVoxModemPresence, failureRange));
    if (numberOrZero(message, kVoxModemState, modemStateRange) == failedState) {
        const auto failure = wholeNumberOf(message[kVoxModemFailedReason], failureRange);
        return failure ? "Failed: " + enumerationText(failures, *failure) : "Failed";
    }
    if (const auto lock = wholeNumberOf(message[kVoxModemLock], lockRange))
        return "Locked: " + enumerationText(locks, *lock) + " required";
    return std::nullopt;
}

std::string workingState(const Dictionary& message) {
    return enumerationText(modemStates, numberOrZero(message, kVoxModemState, modemStateRange));
}

std::optional<std::string> cellTrouble(const Dictionary& message) {
    const std::int64_t report = numberOrZero(message, kVoxModemCellReport, failureRange);
    if (report == static_cast<std::int64_t>(ModemCellReport::Reported))
        return std::nullopt;
    return "Cells " + enumerationText(reports, report);
}

std::optional<std::string> neighborTrouble(const Dictionary& message) {
    const std::int64_t report = numberOrZero(message, kVoxModemNeighborReport, failureRange);
    if (report == static_cast<std::int64_t>(ModemCellReport::Reported))
        return std::nullopt;
    if (report == static_cast<std::int64_t>(ModemCellReport::Unsupported))
        return "Not reported by this modem";
    return "Neighbors " + enumerationText(reports, report);
}

} // namespace velmora::LiveModem
