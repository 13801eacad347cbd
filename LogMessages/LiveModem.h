// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string_view>

/// The messages of the technology Modem: what a live modem reports, as records of the telephony service's
/// extra stream. The payload is a property list whose root is a dictionary; its values are typed, not texts
/// for people. Every message is the whole account of its subject: what it does not name is not there any
/// more. A value that the modem does not know, or that is out of its range, is left out.
///
/// The keys of cells are the telephony service's published ones where it has one
/// (Platform/TelephonyService.h), and new ones in the same style below. Each key is equal to its own name.
/// Numbers are integers where their unit below has none, or as said; reals otherwise.
namespace velmora {

/// The codes, less those that all technologies have (ExtraCode): SIM files, cell information, packet-data
/// contexts.
namespace LiveModemCode {
inline constexpr std::uint32_t sim = 0xFF0000;
inline constexpr std::uint32_t cells = 0xFF0001;
inline constexpr std::uint32_t contexts = 0xFF0002;
inline constexpr std::uint32_t registration = 0xFF0003;
inline constexpr std::uint32_t link = 0xFF0004;
inline constexpr std::uint32_t traffic = 0xFF0005;
inline constexpr std::uint32_t modem = 0xFF0006;
inline constexpr std::uint32_t position = 0xFF0007;
} // namespace LiveModemCode

/// Whether there is a modem to report of; the value of kVoxModemPresence.
enum class ModemPresence : std::int64_t {
    Present = 0,
    NoBus = 1,        ///< no system bus
    NoManager = 2,    ///< ModemManager is not running
    NoPermission = 3, ///< the bus or ModemManager denies the list of modems
    NoModem = 4,      ///< ModemManager has none
    NotTheOne = 5,    ///< the chosen modem is not among those that there are
    NoAnswer = 6,     ///< ModemManager does not answer
};

/// Whether the modem reports its cells; the value of kVoxModemCellReport and kVoxModemNeighborReport.
enum class ModemCellReport : std::int64_t {
    Reported = 0,
    Unsupported = 1,  ///< this modem, or its ModemManager, cannot report them
    NoPermission = 2, ///< the bus policy denies it
    Failing = 3,      ///< the query fails for another reason
    NotYet = 4,       ///< no answer has arrived
};

// In every message of the technology, so that each section can say why it is empty.
/// A ModemPresence.
inline constexpr std::string_view kVoxModemPresence = "kVoxModemPresence";
/// The cause of an absence or a failure, as the bus names it; a text.
inline constexpr std::string_view kVoxModemReason = "kVoxModemReason";
/// ModemManager's MMModemState, -1 (failed) to 11 (connected).
inline constexpr std::string_view kVoxModemState = "kVoxModemState";
/// Its MMModemStateFailedReason, where the state is failed.
inline constexpr std::string_view kVoxModemFailedReason = "kVoxModemFailedReason";
/// Its MMModemLock, where a lock has to be opened before the modem can be used.
inline constexpr std::string_view kVoxModemLock = "kVoxModemLock";

// 0xFF0001, cells: the serving cells first (two under 5G non-standalone: that of LTE, then that of NR),
// neighbours by falling level.
/// The cells, an array of dictionaries.
inline constexpr std::string_view kVoxCellMonitorCells = "kVoxCellMonitorCells";
/// A ModemCellReport each: of cells at all, and of neighbours. The second is absent where the first is not
/// Reported.
inline constexpr std::string_view kVoxModemCellReport = "kVoxModemCellReport";
inline constexpr std::string_view kVoxModemNeighborReport = "kVoxModemNeighborReport";
/// How many cells were left out because the message would have become too long; absent where none were.
inline constexpr std::string_view kVoxModemCellsLeftOut = "kVoxModemCellsLeftOut";
// Of a cell, beside the published keys. Published numbers that mean the same are used with these units here:
// RSSI and RSCP in dBm and ECN0 in dB, whole or not; LAC, TAC, CellId, ARFCN, UARFCN (UMTS and TD-SCDMA), SCN
// (primary scrambling code, or cell parameter ID), PID (physical cell identity of LTE and NR), MCC, MNC.
inline constexpr std::string_view kVoxCellMonitorRadioAccessTechnologyNR =
    "kVoxCellMonitorRadioAccessTechnologyNR";
inline constexpr std::string_view kVoxCellMonitorRadioAccessTechnologyCDMA =
    "kVoxCellMonitorRadioAccessTechnologyCDMA";
inline constexpr std::string_view kVoxCellMonitorMNCDigits = "kVoxCellMonitorMNCDigits"; ///< 2 or 3
inline constexpr std::string_view kVoxCellMonitorEARFCN = "kVoxCellMonitorEARFCN";       ///< of the downlink
inline constexpr std::string_view kVoxCellMonitorNRARFCN = "kVoxCellMonitorNRARFCN";     ///< of the downlink
inline constexpr std::string_view kVoxCellMonitorBSIC = "kVoxCellMonitorBSIC";           ///< 0 to 63
inline constexpr std::string_view kVoxCellMonitorRSRP = "kVoxCellMonitorRSRP";           ///< dBm
inline constexpr std::string_view kVoxCellMonitorRSRQ = "kVoxCellMonitorRSRQ";           ///< dB
inline constexpr std::string_view kVoxCellMonitorSINR = "kVoxCellMonitorSINR";           ///< dB
inline constexpr std::string_view kVoxCellMonitorPathLoss = "kVoxCellMonitorPathLoss";   ///< dB
/// As the air interface counts it: GSM 0 to 63 (3GPP TS 45.010), LTE 0 to 1282 (TS 36.213), NR 0 to 3846
/// (TS 38.213).
inline constexpr std::string_view kVoxCellMonitorTimingAdvance = "kVoxCellMonitorTimingAdvance";
/// kHz, whole; where the modem reports it and no channel number tells it.
inline constexpr std::string_view kVoxCellMonitorDownlinkFrequency = "kVoxCellMonitorDownlinkFrequency";
inline constexpr std::string_view kVoxCellMonitorUplinkFrequency = "kVoxCellMonitorUplinkFrequency";
inline constexpr std::string_view kVoxCellMonitorBandwidth = "kVoxCellMonitorBandwidth"; ///< kHz, whole
inline constexpr std::string_view kVoxCellMonitorSID = "kVoxCellMonitorSID";             ///< CDMA2000: system
inline constexpr std::string_view kVoxCellMonitorNID = "kVoxCellMonitorNID";             ///< network
inline constexpr std::string_view kVoxCellMonitorBaseStation = "kVoxCellMonitorBaseStation";
inline constexpr std::string_view kVoxCellMonitorPN = "kVoxCellMonitorPN"; ///< PN offset
inline constexpr std::string_view kVoxCellMonitorPilotStrength = "kVoxCellMonitorPilotStrength"; ///< dB
/// True where the cell is known by its identity alone: the network's place, not a measurement.
inline constexpr std::string_view kVoxCellMonitorIsPlace = "kVoxCellMonitorIsPlace";

// 0xFF0003, registration.
inline constexpr std::string_view kVoxRegistrationState =
    "kVoxRegistrationState"; ///< MMModem3gppRegistrationState
inline constexpr std::string_view kVoxRegistrationPLMN = "kVoxRegistrationPLMN"; ///< text of 5 or 6 digits
inline constexpr std::string_view kVoxRegistrationOperator = "kVoxRegistrationOperator"; ///< its name, a text
/// MMModem3gppPacketServiceState, where ModemManager knows it.
inline constexpr std::string_view kVoxRegistrationPacketService = "kVoxRegistrationPacketService";
/// MMModemCdmaRegistrationState, of a CDMA modem.
inline constexpr std::string_view kVoxRegistrationCDMA1x = "kVoxRegistrationCDMA1x";
inline constexpr std::string_view kVoxRegistrationEVDO = "kVoxRegistrationEVDO";
inline constexpr std::string_view kVoxRegistrationSID = "kVoxRegistrationSID";
inline constexpr std::string_view kVoxRegistrationNID = "kVoxRegistrationNID";

// 0xFF0004, link.
/// MMModemAccessTechnology, a mask.
inline constexpr std::string_view kVoxLinkAccessTechnologies = "kVoxLinkAccessTechnologies";
inline constexpr std::string_view kVoxLinkSignalQuality = "kVoxLinkSignalQuality"; ///< per cent, whole
inline constexpr std::string_view kVoxLinkIsRecent = "kVoxLinkIsRecent";           ///< of the quality; a flag
// A dictionary each, by technology; the keys of their levels follow.
inline constexpr std::string_view kVoxLinkGSM = "kVoxLinkGSM";
inline constexpr std::string_view kVoxLinkUMTS = "kVoxLinkUMTS";
inline constexpr std::string_view kVoxLinkLTE = "kVoxLinkLTE";
inline constexpr std::string_view kVoxLinkNR = "kVoxLinkNR";
inline constexpr std::string_view kVoxLinkCDMA = "kVoxLinkCDMA";
inline constexpr std::string_view kVoxLinkEVDO = "kVoxLinkEVDO";
inline constexpr std::string_view kVoxLinkRSSI = "kVoxLinkRSSI";           ///< dBm
inline constexpr std::string_view kVoxLinkRSCP = "kVoxLinkRSCP";           ///< dBm
inline constexpr std::string_view kVoxLinkECIO = "kVoxLinkECIO";           ///< dB
inline constexpr std::string_view kVoxLinkRSRP = "kVoxLinkRSRP";           ///< dBm
inline constexpr std::string_view kVoxLinkRSRQ = "kVoxLinkRSRQ";           ///< dB
inline constexpr std::string_view kVoxLinkSINR = "kVoxLinkSINR";           ///< dB
inline constexpr std::string_view kVoxLinkIO = "kVoxLinkIO";               ///< dBm
inline constexpr std::string_view kVoxLinkErrorRate = "kVoxLinkErrorRate"; ///< per cent

// 0xFF0002, packet-data contexts.
/// The contexts, an array of dictionaries.
inline constexpr std::string_view kVoxContexts = "kVoxContexts";
inline constexpr std::string_view kVoxContextBearer = "kVoxContextBearer"; ///< ModemManager's number
inline constexpr std::string_view kVoxContextIsConnected = "kVoxContextIsConnected"; ///< flag
inline constexpr std::string_view kVoxContextIsSuspended = "kVoxContextIsSuspended"; ///< flag
inline constexpr std::string_view kVoxContextType = "kVoxContextType";               ///< MMBearerType
inline constexpr std::string_view kVoxContextProfile = "kVoxContextProfile";         ///< the modem's number
inline constexpr std::string_view kVoxContextAPN = "kVoxContextAPN";                 ///< text
inline constexpr std::string_view kVoxContextIPFamily = "kVoxContextIPFamily";   ///< MMBearerIpFamily, a mask
inline constexpr std::string_view kVoxContextInterface = "kVoxContextInterface"; ///< text
inline constexpr std::string_view kVoxContextError = "kVoxContextError";         ///< why it failed, a text
inline constexpr std::string_view kVoxContextUplinkSpeed = "kVoxContextUplinkSpeed";     ///< bit/s, whole
inline constexpr std::string_view kVoxContextDownlinkSpeed = "kVoxContextDownlinkSpeed"; ///< bit/s, whole
inline constexpr std::string_view kVoxContextStart = "kVoxContextStart";                 ///< a date
// A dictionary each; the keys follow.
inline constexpr std::string_view kVoxContextIPv4 = "kVoxContextIPv4";
inline constexpr std::string_view kVoxContextIPv6 = "kVoxContextIPv6";
inline constexpr std::string_view kVoxContextMethod = "kVoxContextMethod";   ///< MMBearerIpMethod
inline constexpr std::string_view kVoxContextAddress = "kVoxContextAddress"; ///< text, as the other addresses
inline constexpr std::string_view kVoxContextPrefix = "kVoxContextPrefix";   ///< bits
inline constexpr std::string_view kVoxContextGateway = "kVoxContextGateway";
inline constexpr std::string_view kVoxContextDNS = "kVoxContextDNS"; ///< an array of texts
inline constexpr std::string_view kVoxContextMTU = "kVoxContextMTU"; ///< bytes

// 0xFF0005, traffic: a row for each connected bearer whose counters ModemManager knows.
/// The rows, an array of dictionaries.
inline constexpr std::string_view kVoxTraffic = "kVoxTraffic";
inline constexpr std::string_view kVoxTrafficBearer = "kVoxTrafficBearer";       ///< as kVoxContextBearer
inline constexpr std::string_view kVoxTrafficInterface = "kVoxTrafficInterface"; ///< text
inline constexpr std::string_view kVoxTrafficReceived = "kVoxTrafficReceived"; ///< bytes, of this connection
inline constexpr std::string_view kVoxTrafficSent = "kVoxTrafficSent";         ///< bytes
inline constexpr std::string_view kVoxTrafficDuration =
    "kVoxTrafficDuration"; ///< seconds, of this connection
/// bit/s over the time since the earlier answer, and that time in seconds; absent where there is no earlier
/// answer of the same connection, or nothing can be said, as after a restart of the counters.
inline constexpr std::string_view kVoxTrafficDownlinkRate = "kVoxTrafficDownlinkRate";
inline constexpr std::string_view kVoxTrafficUplinkRate = "kVoxTrafficUplinkRate";
inline constexpr std::string_view kVoxTrafficInterval = "kVoxTrafficInterval";

// 0xFF0000, SIM. The published keys kSimFile_ICCID (a text of digits) and kSimFile_MSISDN (an array of texts)
// are used.
inline constexpr std::string_view kSimFile_ICCID = "kSimFile_ICCID";
inline constexpr std::string_view kSimFile_MSISDN = "kSimFile_MSISDN";
inline constexpr std::string_view kVoxSIMIMSI = "kVoxSIMIMSI";                 ///< digits
inline constexpr std::string_view kVoxSIMEID = "kVoxSIMEID";                   ///< digits, of an eUICC
inline constexpr std::string_view kVoxSIMOperatorCode = "kVoxSIMOperatorCode"; ///< 5 or 6 digits
inline constexpr std::string_view kVoxSIMOperatorName = "kVoxSIMOperatorName"; ///< text
inline constexpr std::string_view kVoxSIMGroup1 = "kVoxSIMGroup1";             ///< data, GID1
inline constexpr std::string_view kVoxSIMGroup2 = "kVoxSIMGroup2";             ///< data, GID2
inline constexpr std::string_view kVoxSIMEmergencyNumbers = "kVoxSIMEmergencyNumbers"; ///< an array of texts
/// An array of dictionaries: kVoxSIMOperatorCode and kVoxLinkAccessTechnologies of each.
inline constexpr std::string_view kVoxSIMPreferredNetworks = "kVoxSIMPreferredNetworks";
inline constexpr std::string_view kVoxSIMType = "kVoxSIMType"; ///< MMSimType
/// The slots of a modem that has several: an array of dictionaries with the keys that follow and, of a slot
/// with a SIM, kSimFile_ICCID, kVoxSIMOperatorName, kVoxSIMOperatorCode.
inline constexpr std::string_view kVoxSIMSlots = "kVoxSIMSlots";
inline constexpr std::string_view kVoxSIMSlotNumber = "kVoxSIMSlotNumber";     ///< from 1
inline constexpr std::string_view kVoxSIMSlotIsActive = "kVoxSIMSlotIsActive"; ///< flag
inline constexpr std::string_view kVoxSIMSlotHasSIM = "kVoxSIMSlotHasSIM";     ///< flag

// 0xFF0006, the modem itself.
inline constexpr std::string_view kVoxModemIndex = "kVoxModemIndex";               ///< ModemManager's number
inline constexpr std::string_view kVoxModemManufacturer = "kVoxModemManufacturer"; ///< text, as the next ones
inline constexpr std::string_view kVoxModemModel = "kVoxModemModel";
inline constexpr std::string_view kVoxModemRevision = "kVoxModemRevision";
inline constexpr std::string_view kVoxModemHardware = "kVoxModemHardware";
inline constexpr std::string_view kVoxModemEquipment = "kVoxModemEquipment"; ///< IMEI, MEID or ESN
inline constexpr std::string_view kVoxModemDevice = "kVoxModemDevice"; ///< the device's path in the system
inline constexpr std::string_view kVoxModemPlugin = "kVoxModemPlugin";
inline constexpr std::string_view kVoxModemPort = "kVoxModemPort";             ///< the primary one
inline constexpr std::string_view kVoxModemDrivers = "kVoxModemDrivers";       ///< an array of texts
inline constexpr std::string_view kVoxModemPowerState = "kVoxModemPowerState"; ///< MMModemPowerState
inline constexpr std::string_view kVoxModemCapabilities =
    "kVoxModemCapabilities"; ///< MMModemCapability, a mask
inline constexpr std::string_view kVoxModemManagerVersion = "kVoxModemManagerVersion"; ///< text

// 0xFF0007, position, where ModemManager's location has one.
inline constexpr std::string_view kVoxPositionLatitude = "kVoxPositionLatitude"; ///< degrees, north positive
inline constexpr std::string_view kVoxPositionLongitude = "kVoxPositionLongitude"; ///< degrees, east positive
inline constexpr std::string_view kVoxPositionAltitude = "kVoxPositionAltitude";   ///< metres
inline constexpr std::string_view kVoxPositionTime =
    "kVoxPositionTime"; ///< UTC, as the receiver says it, a text

} // namespace velmora
