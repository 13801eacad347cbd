// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Reports/CellReport.h"

#include "Platform/TelephonyService.h"
#include "Telephony/ModemManager/Bus/ModemManagerNames.h"
#include "Telephony/ModemManager/Members/MemberTable.h"
#include "Telephony/ModemManager/Reports/ModemState.h"

#include <algorithm>
#include <array>
#include <limits>

namespace velmora {
namespace {

/// How a radio technology appears on both sides.
struct RadioKind {
    std::int64_t cellType;
    std::int64_t accessBits;     ///< 0 where ModemManager has none
    std::string_view technology; ///< ours, of a cell
    MemberOf cell;               ///< its rows of the table
    MemberOf place;              ///< AnyCell, which sets nothing, where there is none
    MemberOf signal;
    std::string_view signalMember;
    std::string_view level; ///< the key by which its cells are compared
};
// In order of their generation.
constexpr RadioKind radioKinds[] = {
    {mm::CellType::CDMA, mm::Access::CDMA1x, kVoxCellMonitorRadioAccessTechnologyCDMA, MemberOf::CDMACell,
     MemberOf::AnyCell, MemberOf::CDMASignal, "Cdma", kVoxCellMonitorRSSI},
    {mm::CellType::GSM, mm::Access::GSM, kVoxCellMonitorRadioAccessTechnologyGSM, MemberOf::GSMCell,
     MemberOf::CSLocation, MemberOf::GSMSignal, "Gsm", kVoxCellMonitorRSSI},
    {mm::CellType::TDSCDMA, 0, kVoxCellMonitorRadioAccessTechnologyUTRAN, MemberOf::TDSCDMACell,
     MemberOf::AnyCell, MemberOf::AnyCell, "", kVoxCellMonitorRSCP},
    {mm::CellType::UMTS, mm::Access::UMTS, kVoxCellMonitorRadioAccessTechnologyUMTS, MemberOf::UMTSCell,
     MemberOf::CSLocation, MemberOf::UMTSSignal, "Umts", kVoxCellMonitorRSCP},
    {mm::CellType::LTE, mm::Access::LTE, kVoxCellMonitorRadioAccessTechnologyLTE, MemberOf::LTECell,
     MemberOf::EPSLocation, MemberOf::LTESignal, "Lte", kVoxCellMonitorRSRP},
    {mm::CellType::NR, mm::Access::NR, kVoxCellMonitorRadioAccessTechnologyNR, MemberOf::NRCell,
     MemberOf::NRLocation, MemberOf::NRSignal, "Nr5g", kVoxCellMonitorRSRP},
};

const RadioKind* kindOf(const Dictionary& cell) {
    const std::string* technology = cell[kVoxCellMonitorCellRadioAccessTechnology].asString();
    const auto* kind =
        std::find_if(std::begin(radioKinds), std::end(radioKinds), [technology](const RadioKind& any) {
            return technology && any.technology == *technology;
        });
    return kind == std::end(radioKinds) ? nullptr : kind;
}

/// The technologies that the modem is on, the one that it registered on first: NR counts only where it is
/// alone, since it is the secondary one beside LTE.
std::vector<const RadioKind*> kindsOf(const Modem& modem) {
    const std::int64_t* access = modem[mm::modem]["AccessTechnologies"].asInteger();
    const std::int64_t bits = access && *access > 0 ? *access : 0;
    const RadioKind* main = nullptr;
    for (const RadioKind& kind : radioKinds)
        if (kind.cellType != mm::CellType::NR && (bits & kind.accessBits))
            main = &kind;
    std::vector<const RadioKind*> kinds;
    if (main)
        kinds.push_back(main);
    if (bits & mm::Access::NR)
        kinds.push_back(&radioKinds[std::size(radioKinds) - 1]);
    return kinds;
}

DictionaryRef newCell(const RadioKind& kind, bool serving) {
    return std::make_shared<Dictionary>(Dictionary{
        {std::string(kVoxCellMonitorCellRadioAccessTechnology), kind.technology},
        {std::string(kVoxCellMonitorCellType),
         serving ? kVoxCellMonitorCellTypeServing : kVoxCellMonitorCellTypeNeighbor},
    });
}

/// Whether there were any.
bool addLevels(Dictionary& cell, const RadioKind& kind, const Modem& modem) {
    Dictionary levels;
    setKeys(levels, MemberUse::ServingCell, kind.signal, modem[mm::signal][kind.signalMember]);
    for (const auto& [key, value] : levels)
        if (!cell.contains(key))
            cell.set(key, value);
    return !levels.empty();
}

/// "MCC,MNC,LAC,CI,TAC" as a dictionary; ModemManager before 1.10 reported no TAC.
Dictionary partsOf(std::string_view place) {
    constexpr std::array<std::string_view, 5> names = {"mcc", "mnc", "lac", "ci", "tac"};
    Dictionary parts;
    for (const std::string_view name : names) {
        const std::size_t comma = place.find(',');
        parts.set(name, place.substr(0, comma));
        if (comma == place.npos)
            return parts;
        place.remove_prefix(comma + 1);
    }
    return {}; // more parts than there are
}

/// Where the cell comes in the list, the least first.
double rankOf(const Dictionary& cell) {
    const RadioKind* kind = kindOf(cell);
    if (isServing(cell))
        return kind && kind->cellType == mm::CellType::NR ? -1000 : -1001;
    const double* level = kind ? cell[kind->level].asReal() : nullptr;
    return level ? -*level : std::numeric_limits<double>::max();
}

} // namespace

Dictionaries cellsOf(const Value& cellInformation) {
    Dictionaries cells;
    const Array* entries = cellInformation.asArray();
    if (!entries)
        return cells;
    for (const Value& each : *entries) {
        const Dictionary* members = each.asDictionary();
        const std::int64_t* type = members ? (*members)["cell-type"].asInteger() : nullptr;
        const bool* serving = members ? (*members)["serving"].asBoolean() : nullptr;
        const auto* kind =
            std::find_if(std::begin(radioKinds), std::end(radioKinds),
                         [type](const RadioKind& any) { return type && any.cellType == *type; });
        if (!serving || kind == std::end(radioKinds))
            continue;
        const DictionaryRef cell = newCell(*kind, *serving);
        setKeys(*cell, MemberUse::Cell, kind->cell, *members);
        if (cell->contains(kVoxCellMonitorUARFCN)) {
            cell->remove(kVoxCellMonitorDownlinkFrequency);
            cell->remove(kVoxCellMonitorUplinkFrequency);
        }
        cells.push_back(cell);
    }
    return cells;
}

bool isServing(const Dictionary& cell) {
    const std::string* type = cell[kVoxCellMonitorCellType].asString();
    return type && *type == kVoxCellMonitorCellTypeServing;
}

bool hasServingCell(const Dictionaries& cells) {
    return std::any_of(cells.begin(), cells.end(),
                       [](const DictionaryRef& cell) { return isServing(*cell); });
}

bool hasNeighbor(const Dictionaries& cells) {
    return !std::all_of(cells.begin(), cells.end(),
                        [](const DictionaryRef& cell) { return isServing(*cell); });
}

DictionaryRef placeOf(const Value& location, const Modem& modem) {
    const Dictionary* sources = location.asDictionary();
    const std::string* place = sources ? (*sources)[mm::networkLocationKey].asString() : nullptr;
    const std::vector<const RadioKind*> kinds = kindsOf(modem);
    if (!place || kinds.empty())
        return nullptr;
    DictionaryRef cell = newCell(*kinds.front(), true);
    setKeys(*cell, MemberUse::Cell, kinds.front()->place, partsOf(*place));
    if (!cell->contains(kVoxCellMonitorCellId))
        return nullptr;
    cell->set(kVoxCellMonitorIsPlace, true);
    return cell;
}

void addServingLevels(Dictionaries& cells, const Modem& modem) {
    for (const DictionaryRef& cell : cells)
        if (const RadioKind* kind = isServing(*cell) ? kindOf(*cell) : nullptr)
            addLevels(*cell, *kind, modem);
    const bool hasOne = hasServingCell(cells);
    for (const RadioKind* kind : kindsOf(modem)) {
        const bool isSecondary = kind->cellType == mm::CellType::NR;
        const bool isThere = std::any_of(cells.begin(), cells.end(), [kind](const DictionaryRef& cell) {
            return isServing(*cell) && kindOf(*cell) == kind;
        });
        if (isThere || (hasOne && !isSecondary))
            continue;
        const DictionaryRef cell = newCell(*kind, true);
        if (addLevels(*cell, *kind, modem))
            cells.push_back(cell);
    }
}

void order(Dictionaries& cells) {
    std::stable_sort(cells.begin(), cells.end(),
                     [](const DictionaryRef& a, const DictionaryRef& b) { return rankOf(*a) < rankOf(*b); });
}

DictionaryRef cellReportOf(const CellAnswer& answer, const Modem& modem) {
    DictionaryRef root = rootOf(modem, answer.reason);
    root->set(kVoxModemCellReport, static_cast<std::int64_t>(answer.report));
    if (answer.report == ModemCellReport::Reported) {
        const auto neighbors = answer.hasSeenNeighbors ? ModemCellReport::Reported
                               : answer.cells.empty()  ? ModemCellReport::NotYet
                                                       : ModemCellReport::Unsupported;
        root->set(kVoxModemNeighborReport, static_cast<std::int64_t>(neighbors));
    }
    Dictionaries cells;
    for (const DictionaryRef& each : answer.cells)
        cells.push_back(std::make_shared<Dictionary>(*each));
    if (!hasServingCell(cells))
        if (const DictionaryRef place = placeOf(answer.location, modem))
            cells.push_back(place);
    addServingLevels(cells, modem);
    order(cells);
    const ArrayRef array = makeArray();
    for (const DictionaryRef& each : cells)
        array->append(Value(each));
    root->set(kVoxCellMonitorCells, array);
    return root;
}

} // namespace velmora
