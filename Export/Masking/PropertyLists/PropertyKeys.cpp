// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/PropertyLists/PropertyKeys.h"

#include "LogMessages/LiveModem.h"
#include "Platform/TelephonyService.h"

#include <algorithm>
#include <functional>
#include <unordered_map>

namespace velmora {

namespace {

using enum PropertyForm;

constexpr PropertyKey simFileKeys[] = {
    {"kSimFile_ICCID", ICCID},     {"kSimFile_MSISDN", Phone},      {"kSimFile_MBDN", Phone},
    {"kSimFile_HPPLMN", Group},    {"kSimFile_LOCI", Personal},     {"kSimFile_PSLOCI", Personal},
    {"kSimFile_ACC", Personal},    {"kSimFile_AD", Group},          {"kSimFile_FPLMN", Network},
    {"kSimFile_AHPLMN", AreaText}, {"kSimFile_RATMODE", Group},     {"kSimFile_PNN", NetworkName},
    {"kSimFile_OPL", AreaText},    {"kSimFile_OPLMNAcT", AreaText},
};

constexpr PropertyKey cellKeys[] = {
    {kVoxCellMonitorCellRadioAccessTechnology, Text},
    {kVoxCellMonitorCellType, Text},
    {kVoxCellMonitorMCC, CountryCode},
    {kVoxCellMonitorMNC, NetworkCode},
    {kVoxCellMonitorLAC, LocationArea},
    {kVoxCellMonitorTAC, TrackingArea},
    {kVoxCellMonitorCellId, Cell},
    {kVoxCellMonitorARFCN, Number},
    {kVoxCellMonitorUARFCN, Number},
    {kVoxCellMonitorPID, Number},
    {kVoxCellMonitorSCN, Number},
    {kVoxCellMonitorRSSI, Number},
    {kVoxCellMonitorRSCP, Number},
    {kVoxCellMonitorECN0, Number},
    {kVoxCellMonitorBandInfo, Number},
};

constexpr PropertyKey contextKeys[] = {
    {"Context ID", Text},
    {"NSAPI", Text},
    {"APN", NetworkName},
    {"PDP Type", Text},
    {"PDP Address", Address},
    {"Primary DNS", Address},
    {"Secondary DNS", Address},
    {"QoS Traffic Class", Text},
    {"Maximum Bit Rate Uplink", Text},
    {"Maximum Bit Rate Downlink", Text},
};

constexpr PropertyKey displayKeys[] = {
    {"Registration", Text},
    {"State", Text},
    {"PLMN", Network},
    {"LAC", LocationArea},
    {"RAC", RoutingArea},
    {"Network Name", NetworkName},
    {"Full", Inner},
    {"Text", Inner},
    {"Equivalent PLMNs", Network},
    {"Serving Cell", Text},
    {"Neighbor Cells", Text},
    {"ARFCN", Text},
    {"Band", Text},
    {"BSIC", Text},
    {"RxLev", Text},
    {"C1", Text},
    {"C2", Text},
    {"Cell ID", Cell},
    {"Dedicated Channel", Text},
    {"Type", Text},
    {"Codec", Text},
    {"Timeslot", Text},
    {"RxQual Full", Text},
    {"RxQual Sub", Text},
    {"Duration", Text},
    {"Seconds", Inner},
    {"Packet Data", Text},
    {"Contexts", Text},
    {"Context ID", Text},
    {"APN", NetworkName},
    {"Address", Address},
    {"Coding Scheme", Text},
    {"SIM", Personal},
    {"ICCID", ICCID},
};

constexpr PropertyKey modemKeys[] = {
    {kVoxModemPresence, Number},
    {kVoxModemReason, Text},
    {kVoxModemState, Number},
    {kVoxModemFailedReason, Number},
    {kVoxModemLock, Number},
    // cells
    {kVoxCellMonitorCells, Text},
    {kVoxModemCellReport, Number},
    {kVoxModemNeighborReport, Number},
    {kVoxModemCellsLeftOut, Number},
    {kVoxCellMonitorCellRadioAccessTechnology, Text},
    {kVoxCellMonitorCellType, Text},
    {kVoxCellMonitorMCC, CountryCode},
    {kVoxCellMonitorMNC, NetworkCode},
    {kVoxCellMonitorLAC, LocationArea},
    {kVoxCellMonitorTAC, TrackingArea},
    {kVoxCellMonitorCellId, Cell},
    {kVoxCellMonitorARFCN, Number},
    {kVoxCellMonitorUARFCN, Number},
    {kVoxCellMonitorPID, Number},
    {kVoxCellMonitorSCN, Number},
    {kVoxCellMonitorRSSI, Number},
    {kVoxCellMonitorRSCP, Number},
    {kVoxCellMonitorECN0, Number},
    {kVoxCellMonitorBandInfo, Number},
    {kVoxCellMonitorMNCDigits, Number},
    {kVoxCellMonitorEARFCN, Number},
    {kVoxCellMonitorNRARFCN, Number},
    {kVoxCellMonitorBSIC, Number},
    {kVoxCellMonitorRSRP, Number},
    {kVoxCellMonitorRSRQ, Number},
    {kVoxCellMonitorSINR, Number},
    {kVoxCellMonitorPathLoss, Number},
    {kVoxCellMonitorTimingAdvance, Number},
    {kVoxCellMonitorDownlinkFrequency, Number},
    {kVoxCellMonitorUplinkFrequency, Number},
    {kVoxCellMonitorBandwidth, Number},
    {kVoxCellMonitorSID, System},
    {kVoxCellMonitorNID, NetworkID},
    {kVoxCellMonitorBaseStation, BaseStation},
    {kVoxCellMonitorPN, Number},
    {kVoxCellMonitorPilotStrength, Number},
    {kVoxCellMonitorIsPlace, Number},
    // registration
    {kVoxRegistrationState, Number},
    {kVoxRegistrationPLMN, Network},
    {kVoxRegistrationOperator, NetworkName},
    {kVoxRegistrationPacketService, Number},
    {kVoxRegistrationCDMA1x, Number},
    {kVoxRegistrationEVDO, Number},
    {kVoxRegistrationSID, System},
    {kVoxRegistrationNID, NetworkID},
    // link
    {kVoxLinkAccessTechnologies, Number},
    {kVoxLinkSignalQuality, Number},
    {kVoxLinkIsRecent, Number},
    {kVoxLinkGSM, Number},
    {kVoxLinkUMTS, Number},
    {kVoxLinkLTE, Number},
    {kVoxLinkNR, Number},
    {kVoxLinkCDMA, Number},
    {kVoxLinkEVDO, Number},
    {kVoxLinkRSSI, Number},
    {kVoxLinkRSCP, Number},
    {kVoxLinkECIO, Number},
    {kVoxLinkRSRP, Number},
    {kVoxLinkRSRQ, Number},
    {kVoxLinkSINR, Number},
    {kVoxLinkIO, Number},
    {kVoxLinkErrorRate, Number},
    // contexts
    {kVoxContexts, Text},
    {kVoxContextBearer, Number},
    {kVoxContextIsConnected, Number},
    {kVoxContextIsSuspended, Number},
    {kVoxContextType, Number},
    {kVoxContextProfile, Number},
    {kVoxContextAPN, NetworkName},
    {kVoxContextIPFamily, Number},
    {kVoxContextInterface, Text},
    {kVoxContextError, Text},
    {kVoxContextUplinkSpeed, Number},
    {kVoxContextDownlinkSpeed, Number},
    {kVoxContextStart, DateValue},
    {kVoxContextIPv4, Text},
    {kVoxContextIPv6, Text},
    {kVoxContextMethod, Number},
    {kVoxContextAddress, Address},
    {kVoxContextPrefix, Number},
    {kVoxContextGateway, Address},
    {kVoxContextDNS, Address},
    {kVoxContextMTU, Number},
    // traffic
    {kVoxTraffic, Text},
    {kVoxTrafficBearer, Number},
    {kVoxTrafficInterface, Text},
    {kVoxTrafficReceived, Number},
    {kVoxTrafficSent, Number},
    {kVoxTrafficDuration, Number},
    {kVoxTrafficDownlinkRate, Number},
    {kVoxTrafficUplinkRate, Number},
    {kVoxTrafficInterval, Number},
    // SIM
    {kSimFile_ICCID, ICCID},
    {kSimFile_MSISDN, Phone},
    {kVoxSIMIMSI, IMSI},
    {kVoxSIMEID, EID},
    {kVoxSIMOperatorCode, Network},
    {kVoxSIMOperatorName, NetworkName},
    {kVoxSIMGroup1, Group},
    {kVoxSIMGroup2, Group},
    {kVoxSIMEmergencyNumbers, ShortNumbers},
    {kVoxSIMPreferredNetworks, Text},
    {kVoxSIMType, Number},
    {kVoxSIMSlots, Text},
    {kVoxSIMSlotNumber, Number},
    {kVoxSIMSlotIsActive, Number},
    {kVoxSIMSlotHasSIM, Number},
    // modem
    {kVoxModemIndex, Number},
    {kVoxModemManufacturer, Text},
    {kVoxModemModel, Text},
    {kVoxModemRevision, Text},
    {kVoxModemHardware, Text},
    {kVoxModemEquipment, Equipment},
    {kVoxModemDevice, Text},
    {kVoxModemPlugin, Text},
    {kVoxModemPort, Text},
    {kVoxModemDrivers, Text},
    {kVoxModemPowerState, Number},
    {kVoxModemCapabilities, Number},
    {kVoxModemManagerVersion, Text},
    // position
    {kVoxPositionLatitude, Position},
    {kVoxPositionLongitude, Position},
    {kVoxPositionAltitude, Position},
    {kVoxPositionTime, ClockTime},
};

/// The keys of a table differ in their ends.
struct EndHash {
    std::size_t operator()(std::string_view key) const {
        constexpr std::size_t longest = 8;
        return std::hash<std::string_view>{}(key.substr(key.size() - std::min(key.size(), longest))) +
               key.size();
    }
};

using Forms = std::unordered_map<std::string_view, PropertyForm, EndHash>;

Forms formsOf(std::span<const PropertyKey> keys) {
    Forms forms;
    for (const PropertyKey& each : keys)
        forms.emplace(each.key, each.form);
    return forms;
}

} // namespace

std::span<const PropertyKey> keysOf(PropertyListKind kind) {
    switch (kind) {
    case PropertyListKind::SIMFiles: return simFileKeys;
    case PropertyListKind::Cells: return cellKeys;
    case PropertyListKind::Contexts: return contextKeys;
    case PropertyListKind::Display: return displayKeys;
    case PropertyListKind::Modem: break;
    }
    return modemKeys;
}

std::optional<PropertyForm> formOf(PropertyListKind kind, std::string_view key) {
    static const Forms forms[] = {formsOf(simFileKeys), formsOf(cellKeys), formsOf(contextKeys),
                                  formsOf(displayKeys), formsOf(modemKeys)};
    const Forms& known = forms[static_cast<unsigned>(kind)];
    const auto found = known.find(key);
    return found == known.end() ? std::nullopt : std::optional(found->second);
}

} // namespace velmora
