// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Reports/ModemReport.h"

#include "Platform/TelephonyService.h"
#include "Telephony/ModemManager/Bus/ModemManagerNames.h"
#include "Telephony/ModemManager/Members/MemberTable.h"

#include <algorithm>
#include <array>

namespace velmora {
namespace {

/// How a radio technology appears on both sides.
struct RadioKind {
    std::int64_t cellType;
    std::int64_t accessBits;
    std::string_view technology; ///< the service's, of a cell
    MemberOf cell;               ///< its rows of the table
    MemberOf place;
    MemberOf signal;
    std::string_view signalMember;
};
// In order of their generation: a modem on several of them at once reports its location in the last.
constexpr RadioKind radioKinds[] = {
    {mm::CellType::GSM, mm::Access::GSM, kVoxCellMonitorRadioAccessTechnologyGSM, MemberOf::GSMCell,
     MemberOf::CSLocation, MemberOf::GSMSignal, "Gsm"},
    {mm::CellType::UMTS, mm::Access::UMTS, kVoxCellMonitorRadioAccessTechnologyUMTS, MemberOf::UMTSCell,
     MemberOf::CSLocation, MemberOf::UMTSSignal, "Umts"},
    {mm::CellType::LTE, mm::Access::LTE, kVoxCellMonitorRadioAccessTechnologyLTE, MemberOf::LTECell,
     MemberOf::EPSLocation, MemberOf::LTESignal, "Lte"},
};

std::int64_t bitsOf(const Modem& modem, std::string_view member) {
    const std::int64_t* bits = modem[mm::modem][member].asInteger();
    return bits && *bits >= 0 ? *bits : 0;
}

DictionaryRef newCell(const RadioKind& kind, bool serving) {
    return std::make_shared<Dictionary>(Dictionary{
        {std::string(kVoxCellMonitorCellRadioAccessTechnology), kind.technology},
        {std::string(kVoxCellMonitorCellType),
         serving ? kVoxCellMonitorCellTypeServing : kVoxCellMonitorCellTypeNeighbor},
    });
}

/// The levels of ModemManager's own polling, where the cell does not have its own.
void addServingLevels(Dictionary& cell, const RadioKind& kind, const Modem& modem) {
    Dictionary levels;
    setKeys(levels, MemberUse::ServingCell, kind.signal, modem[mm::signal][kind.signalMember]);
    for (const auto& [key, value] : levels)
        if (!cell.contains(key))
            cell.set(key, value);
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

void addLink(Dictionary& context, const Modem& modem) {
    setKeys(context, MemberUse::Link, MemberOf::Modem3gpp, modem[mm::modem3gpp]);
    setKeys(context, MemberUse::Link, MemberOf::Modem, modem[mm::modem]);
    const Dictionary& signal = modem[mm::signal];
    setKeys(context, MemberUse::Link, MemberOf::GSMSignal, signal["Gsm"]);
    setKeys(context, MemberUse::Link, MemberOf::UMTSSignal, signal["Umts"]);
    setKeys(context, MemberUse::Link, MemberOf::LTESignal, signal["Lte"]);
    setKeys(context, MemberUse::Link, MemberOf::NRSignal, signal["Nr5g"]);
}

} // namespace

std::string_view accessTechnologyOf(const Modem& modem) {
    const std::int64_t bits = bitsOf(modem, "AccessTechnologies");
    if (bits & (mm::Access::LTE | mm::Access::NR))
        return kVoxLogChannelTechnology_Ostrel_LTE;
    if (bits & (mm::Access::GSM | mm::Access::UMTS))
        return kVoxLogChannelTechnology_Ostrel_GSM;
    return {};
}

std::string_view technologyOf(const Modem& modem) {
    if (const std::string_view technology = accessTechnologyOf(modem); !technology.empty())
        return technology;
    const std::int64_t bits = bitsOf(modem, "CurrentCapabilities");
    if (bits & (mm::Capability::LTE | mm::Capability::NR))
        return kVoxLogChannelTechnology_Ostrel_LTE;
    if (bits & mm::Capability::GSM_UMTS)
        return kVoxLogChannelTechnology_Ostrel_GSM;
    return {};
}

Dictionaries cellsOf(const Value& cellInformation, const Modem& modem) {
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
        if (!serving || kind == std::end(radioKinds) || cells.size() >= maximumCells)
            continue;
        const DictionaryRef cell = newCell(*kind, *serving);
        setKeys(*cell, MemberUse::Cell, kind->cell, *members);
        if (*serving)
            addServingLevels(*cell, *kind, modem);
        cells.push_back(cell);
    }
    return cells;
}

bool hasServingCell(const Dictionaries& cells) {
    return std::any_of(cells.begin(), cells.end(), [](const DictionaryRef& cell) {
        const std::string* type = (*cell)[kVoxCellMonitorCellType].asString();
        return type && *type == kVoxCellMonitorCellTypeServing;
    });
}

DictionaryRef servingCellFromLocation(const Value& location, const Modem& modem) {
    const Dictionary* sources = location.asDictionary();
    const std::string* place = sources ? (*sources)[mm::location3gppKey].asString() : nullptr;
    if (!place)
        return nullptr;
    const Dictionary parts = partsOf(*place);
    DictionaryRef cell;
    for (const RadioKind& kind : radioKinds) {
        if (!(bitsOf(modem, "AccessTechnologies") & kind.accessBits))
            continue;
        const DictionaryRef candidate = newCell(kind, true);
        setKeys(*candidate, MemberUse::Cell, kind.place, parts);
        if (!candidate->contains(kVoxCellMonitorCellId))
            continue;
        addServingLevels(*candidate, kind, modem);
        cell = candidate;
    }
    return cell;
}

DictionaryRef simFilesOf(const Modem& modem, const Dictionary& sim) {
    DictionaryRef files = makeDictionary();
    setKeys(*files, MemberUse::SIMFile, MemberOf::SIM, sim);
    setKeys(*files, MemberUse::SIMFile, MemberOf::Modem, modem[mm::modem]);
    return files;
}

Dictionaries contextsOf(const Modem& modem, const std::vector<ModemBearer>& bearers) {
    Dictionaries contexts;
    for (const ModemBearer& bearer : bearers) {
        const DictionaryRef context = makeDictionary();
        context->set("Bearer", bearer.path.substr(bearer.path.rfind('/') + 1));
        const Dictionary& properties = *bearer.properties;
        setKeys(*context, MemberUse::Bearer, MemberOf::Bearer, properties);
        setKeys(*context, MemberUse::Bearer, MemberOf::BearerProperties, properties["Properties"]);
        setKeys(*context, MemberUse::Bearer, MemberOf::IPv4, properties["Ip4Config"]);
        setKeys(*context, MemberUse::Bearer, MemberOf::IPv6, properties["Ip6Config"]);
        setKeys(*context, MemberUse::Bearer, MemberOf::Statistics, properties["Stats"]);
        addLink(*context, modem);
        contexts.push_back(context);
    }
    if (!contexts.empty())
        return contexts;
    const DictionaryRef link = makeDictionary();
    addLink(*link, modem);
    if (link->empty())
        return contexts;
    const DictionaryRef context = std::make_shared<Dictionary>(Dictionary{{"Bearer", "None"}});
    addLink(*context, modem);
    contexts.push_back(context);
    return contexts;
}

} // namespace velmora
