// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Members/MemberTable.h"

#include "LogMessages/LiveModem.h"
#include "Platform/TelephonyService.h"
#include "Telephony/ModemManager/Members/MemberNumber.h"
#include "Telephony/ModemManager/Members/MemberText.h"

#include <cstdint>
#include <utility>

namespace velmora {
namespace {

using namespace convert;
using enum MemberUse;
using Of = MemberOf;

// Identities and channels, and the largest that the air interface has.
constexpr auto gsmCellId = cellIdentity<0xFFFF>;
constexpr auto longCellId = cellIdentity<0xFFF'FFFF>;
constexpr auto nrCellId = cellIdentity<0xF'FFFF'FFFF>;
constexpr auto ltePhysicalCell = hexadecimalNumber<503>;
constexpr auto nrPhysicalCell = hexadecimalNumber<1007>;
constexpr auto arfcn = number<1023>;
constexpr auto uarfcn = numberFrom<1, 16383>;
constexpr auto nrarfcn = numberFrom<1, 3'279'165>;
constexpr auto bsic = hexadecimalNumber<63>;
constexpr auto scramblingCode = number<511>;
constexpr auto cellParameter = number<127>;
constexpr auto pathLoss = wholeLevel<1, 200>;
constexpr auto system = numberFrom<1, 0x7FFF>;
constexpr auto systemInHex = hexadecimalNumber<0x7FFF>;
constexpr auto subnetwork = number<0xFFFE>;
constexpr auto subnetworkInHex = hexadecimalNumber<0xFFFE>;

// Levels: the reporting ranges of 3GPP TS 45.008, 25.133, 36.133 and 38.133, with room for modems that
// measure on. ModemManager's unknown level, -9999, is far out.
constexpr auto power = level<-150, 0>;
constexpr auto rsrp = level<-156, -20>;
constexpr auto rsrq = level<-43, 20>;
constexpr auto ecio = level<-60, 0>;
constexpr auto sinr = level<-60, 60>;
constexpr auto percent = level<0, 100>;

// Enumerations whose 0 says that the value is unknown, and those whose 0 is a value; later versions may have
// more.
constexpr auto known = numberFrom<1, 255>;
constexpr auto enumeration = number<255>;
constexpr auto family = numberFrom<1, 15>;
constexpr auto modemState = numberFrom<-1, 255>;
constexpr auto packetSize = numberFrom<1, 65535>;
constexpr auto count = number<INT64_MAX>;
constexpr auto speed = numberFrom<1, INT64_MAX>;

constexpr auto mccKey = kVoxCellMonitorMCC;
constexpr auto mncKey = kVoxCellMonitorMNC;
constexpr auto digitsKey = kVoxCellMonitorMNCDigits;
constexpr auto lacKey = kVoxCellMonitorLAC;
constexpr auto tacKey = kVoxCellMonitorTAC;
constexpr auto cellIdKey = kVoxCellMonitorCellId;
constexpr auto advanceKey = kVoxCellMonitorTimingAdvance;

constexpr std::string_view country = "first three digits of \"MCCMNC\"";
constexpr std::string_view rest = "the digits after them";
constexpr std::string_view howMany = "how many those are";
constexpr std::string_view hex16 = "hexadecimal text, 16 bits; 0, FFFE and FFFF say that none is known";
constexpr std::string_view hex24 =
    "hexadecimal text, 24 bits; 0 and all bits set, or all but the last, say that none is known";
constexpr std::string_view tag = "unchanged";
constexpr std::string_view dBm = "dBm, unchanged";
constexpr std::string_view dB = "dB, unchanged";
constexpr std::string_view perCent = "per cent, unchanged";
constexpr std::string_view asMask = "mask, unchanged; 0 says that none is known";
constexpr std::string_view asNumber = "enumeration, as its number";
constexpr std::string_view asKnown = "enumeration, as its number; 0 says that it is unknown";
constexpr std::string_view secret = "a credential, which is not a measurement and stays in ModemManager";
constexpr std::string_view steering =
    "it configures the modem or the connection and does not describe the link";
constexpr std::string_view ability = "what the modem could do, not what it does";
constexpr std::string_view past = "of the bearer's past, not of the connection";

/// A member that sets a key of a message.
constexpr MemberRow sets(Of of, std::string_view member, MemberUse use, std::string_view key,
                         Value (*conversion)(const Value&), std::string_view note) {
    return {of, member, use, key, conversion, note};
}

/// A member that is appended to a list.
constexpr MemberRow lists(Of of, std::string_view member, MemberUse use, std::string_view key,
                          Value (*conversion)(const Value&), std::string_view note) {
    return {of, member, use, key, conversion, note, true};
}

/// A member that the service itself uses.
constexpr MemberRow serves(Of of, std::string_view member, std::string_view note) {
    return {of, member, Service, {}, nullptr, note};
}

/// A member that is left unused.
constexpr MemberRow unused(Of of, std::string_view member, std::string_view why) {
    return {of, member, Unused, {}, nullptr, why};
}

// clang-format off
constexpr MemberRow table[] = {
    // Its interface or dictionary and its name; then its use, the key that it sets, the conversion, and both sides' units
    // and encodings; or what the service uses it for; or why it is unused.

    // Cells of Modem.GetCellInfo. Identities are hexadecimal text there and numbers here.
    serves(Of::AnyCell,          "cell-type",            "number; chooses the rows, and the radio access technology"),
    serves(Of::AnyCell,          "serving",              "boolean; the cell type, serving or neighbour"),

    sets  (Of::CDMACell,         "sid",                  Cell, kVoxCellMonitorSID,         systemInHex,     "hexadecimal text, 15 bits"),
    sets  (Of::CDMACell,         "nid",                  Cell, kVoxCellMonitorNID,         subnetworkInHex, "hexadecimal text, 16 bits; FFFF says that none is known"),
    sets  (Of::CDMACell,         "base-station-id",      Cell, kVoxCellMonitorBaseStation, cellIdentity<0xFFFF>, "hexadecimal text, 16 bits; FFFF says that none is known"),
    sets  (Of::CDMACell,         "ref-pn",               Cell, kVoxCellMonitorPN,          hexadecimalNumber<511>, "hexadecimal text, 9 bits"),
    unused(Of::CDMACell,         "pilot-strength",       "ModemManager documents no unit (\"format and scale as the GSM SINR\"); Signal.Cdma has the serving cell's Ec/Io"),

    sets  (Of::GSMCell,          "operator-id",          Cell, mccKey,                  countryCode,     country),
    sets  (Of::GSMCell,          "operator-id",          Cell, mncKey,                  networkCode,     rest),
    sets  (Of::GSMCell,          "operator-id",          Cell, digitsKey,               networkDigits,   howMany),
    sets  (Of::GSMCell,          "lac",                  Cell, lacKey,                  areaCode,        hex16),
    sets  (Of::GSMCell,          "ci",                   Cell, cellIdKey,               gsmCellId,       "hexadecimal text, 16 bits; FFFF says that none is known"),
    sets  (Of::GSMCell,          "arfcn",                Cell, kVoxCellMonitorARFCN,    arfcn,           tag),
    sets  (Of::GSMCell,          "base-station-id",      Cell, kVoxCellMonitorBSIC,     bsic,            "hexadecimal text, 6 bits: the base station identity code"),
    sets  (Of::GSMCell,          "rx-level",             Cell, kVoxCellMonitorRSSI,     levelOfRXLEV,    "RXLEV, 1 dB up from -111 dBm, to dBm"),
    sets  (Of::GSMCell,          "timing-advance",       Cell, advanceKey,              number<63>,      "bit periods, unchanged"),

    sets  (Of::UMTSCell,         "operator-id",          Cell, mccKey,                  countryCode,     country),
    sets  (Of::UMTSCell,         "operator-id",          Cell, mncKey,                  networkCode,     rest),
    sets  (Of::UMTSCell,         "operator-id",          Cell, digitsKey,               networkDigits,   howMany),
    sets  (Of::UMTSCell,         "lac",                  Cell, lacKey,                  areaCode,        hex16),
    sets  (Of::UMTSCell,         "ci",                   Cell, cellIdKey,               longCellId,      "hexadecimal text, 28 bits; all set say that none is known"),
    sets  (Of::UMTSCell,         "frequency-tdd",        Cell, kVoxCellMonitorUARFCN,   channelInFrequency, "up to 16383 it is the channel number"),
    sets  (Of::UMTSCell,         "frequency-fdd-dl",     Cell, kVoxCellMonitorUARFCN,   channelInFrequency, "up to 16383 it is the channel number"),
    sets  (Of::UMTSCell,         "uarfcn",               Cell, kVoxCellMonitorUARFCN,   uarfcn,          tag),
    sets  (Of::UMTSCell,         "frequency-tdd",        Cell, kVoxCellMonitorDownlinkFrequency, frequency, "kHz, unchanged; left out where the channel number tells it"),
    sets  (Of::UMTSCell,         "frequency-fdd-dl",     Cell, kVoxCellMonitorDownlinkFrequency, frequency, "kHz, unchanged; left out where the channel number tells it"),
    sets  (Of::UMTSCell,         "frequency-fdd-ul",     Cell, kVoxCellMonitorUplinkFrequency,   frequency, "kHz, unchanged; left out where the channel number tells it"),
    sets  (Of::UMTSCell,         "psc",                  Cell, kVoxCellMonitorSCN,      scramblingCode,  tag),
    sets  (Of::UMTSCell,         "rscp",                 Cell, kVoxCellMonitorRSCP,     power,           dBm),
    sets  (Of::UMTSCell,         "ecio",                 Cell, kVoxCellMonitorECN0,     ecio,            dB),
    sets  (Of::UMTSCell,         "path-loss",            Cell, kVoxCellMonitorPathLoss, pathLoss,        "dB, unchanged"),

    sets  (Of::TDSCDMACell,      "operator-id",          Cell, mccKey,                  countryCode,     country),
    sets  (Of::TDSCDMACell,      "operator-id",          Cell, mncKey,                  networkCode,     rest),
    sets  (Of::TDSCDMACell,      "operator-id",          Cell, digitsKey,               networkDigits,   howMany),
    sets  (Of::TDSCDMACell,      "lac",                  Cell, lacKey,                  areaCode,        hex16),
    sets  (Of::TDSCDMACell,      "ci",                   Cell, cellIdKey,               longCellId,      "hexadecimal text, 28 bits; all set say that none is known"),
    sets  (Of::TDSCDMACell,      "uarfcn",               Cell, kVoxCellMonitorUARFCN,   uarfcn,          tag),
    sets  (Of::TDSCDMACell,      "cell-parameter-id",    Cell, kVoxCellMonitorSCN,      cellParameter,   tag),
    sets  (Of::TDSCDMACell,      "rscp",                 Cell, kVoxCellMonitorRSCP,     power,           dBm),
    sets  (Of::TDSCDMACell,      "path-loss",            Cell, kVoxCellMonitorPathLoss, pathLoss,        "dB, unchanged"),
    unused(Of::TDSCDMACell,      "timing-advance",       "documented in bit periods of GSM, which TD-SCDMA does not have"),

    sets  (Of::LTECell,          "operator-id",          Cell, mccKey,                  countryCode,     country),
    sets  (Of::LTECell,          "operator-id",          Cell, mncKey,                  networkCode,     rest),
    sets  (Of::LTECell,          "operator-id",          Cell, digitsKey,               networkDigits,   howMany),
    sets  (Of::LTECell,          "tac",                  Cell, tacKey,                  areaCode,        hex16),
    sets  (Of::LTECell,          "ci",                   Cell, cellIdKey,               longCellId,      "hexadecimal text, 28 bits; all set say that none is known"),
    sets  (Of::LTECell,          "physical-ci",          Cell, kVoxCellMonitorPID,      ltePhysicalCell, "hexadecimal text, 0 to 503"),
    sets  (Of::LTECell,          "earfcn",               Cell, kVoxCellMonitorEARFCN,   earfcn,          "unchanged; 65535 says that none is known"),
    sets  (Of::LTECell,          "rsrp",                 Cell, kVoxCellMonitorRSRP,     rsrp,            dBm),
    sets  (Of::LTECell,          "rsrq",                 Cell, kVoxCellMonitorRSRQ,     rsrq,            dB),
    sets  (Of::LTECell,          "timing-advance",       Cell, advanceKey,              number<1282>,    tag),

    sets  (Of::NRCell,           "operator-id",          Cell, mccKey,                  countryCode,     country),
    sets  (Of::NRCell,           "operator-id",          Cell, mncKey,                  networkCode,     rest),
    sets  (Of::NRCell,           "operator-id",          Cell, digitsKey,               networkDigits,   howMany),
    sets  (Of::NRCell,           "tac",                  Cell, tacKey,                  longAreaCode,    hex24),
    sets  (Of::NRCell,           "ci",                   Cell, cellIdKey,               nrCellId,        "hexadecimal text, 36 bits; all set say that none is known"),
    sets  (Of::NRCell,           "physical-ci",          Cell, kVoxCellMonitorPID,      nrPhysicalCell,  "hexadecimal text, 0 to 1007"),
    sets  (Of::NRCell,           "nrarfcn",              Cell, kVoxCellMonitorNRARFCN,  nrarfcn,         "unchanged; 0 says that none is known"),
    sets  (Of::NRCell,           "rsrp",                 Cell, kVoxCellMonitorRSRP,     rsrp,            dBm),
    sets  (Of::NRCell,           "rsrq",                 Cell, kVoxCellMonitorRSRQ,     rsrq,            dB),
    sets  (Of::NRCell,           "sinr",                 Cell, kVoxCellMonitorSINR,     sinr,            dB),
    sets  (Of::NRCell,           "timing-advance",       Cell, advanceKey,              number<3846>,    tag),

    // Modem.Location.GetLocation: the serving cell where GetCellInfo names none, and the position.
    sets  (Of::CSLocation,       "mcc",                  Cell, mccKey,                  countryCodeAlone,   "decimal text"),
    sets  (Of::CSLocation,       "mnc",                  Cell, mncKey,                  networkCodeAlone,   "decimal text"),
    sets  (Of::CSLocation,       "mnc",                  Cell, digitsKey,               networkDigitsAlone, "its length"),
    sets  (Of::CSLocation,       "lac",                  Cell, lacKey,                  areaCode,           hex16),
    sets  (Of::CSLocation,       "ci",                   Cell, cellIdKey,               longCellId,         "hexadecimal text, 28 bits"),
    unused(Of::CSLocation,       "tac",                  "GSM and UMTS have no tracking areas"),
    sets  (Of::EPSLocation,      "mcc",                  Cell, mccKey,                  countryCodeAlone,   "decimal text"),
    sets  (Of::EPSLocation,      "mnc",                  Cell, mncKey,                  networkCodeAlone,   "decimal text"),
    sets  (Of::EPSLocation,      "mnc",                  Cell, digitsKey,               networkDigitsAlone, "its length"),
    sets  (Of::EPSLocation,      "tac",                  Cell, tacKey,                  areaCode,           hex16),
    sets  (Of::EPSLocation,      "ci",                   Cell, cellIdKey,               longCellId,         "hexadecimal text, 28 bits"),
    unused(Of::EPSLocation,      "lac",                  "it is that of the fallback for calls, not of the LTE cell"),
    sets  (Of::NRLocation,       "mcc",                  Cell, mccKey,                  countryCodeAlone,   "decimal text"),
    sets  (Of::NRLocation,       "mnc",                  Cell, mncKey,                  networkCodeAlone,   "decimal text"),
    sets  (Of::NRLocation,       "mnc",                  Cell, digitsKey,               networkDigitsAlone, "its length"),
    sets  (Of::NRLocation,       "tac",                  Cell, tacKey,                  longAreaCode,       hex24),
    sets  (Of::NRLocation,       "ci",                   Cell, cellIdKey,               nrCellId,           "hexadecimal text, 36 bits"),
    unused(Of::NRLocation,       "lac",                  "NR has no location areas"),
    sets  (Of::Satellites,       "latitude",             Position, kVoxPositionLatitude,  latitude,         "degrees, north positive, unchanged"),
    sets  (Of::Satellites,       "longitude",            Position, kVoxPositionLongitude, longitude,        "degrees, east positive, unchanged"),
    sets  (Of::Satellites,       "altitude",             Position, kVoxPositionAltitude,  altitude,         "metres, unchanged"),
    sets  (Of::Satellites,       "utc-time",             Position, kVoxPositionTime,      text,             tag),
    serves(Of::Sentences,        "GGA",                  "time, latitude, longitude and altitude, where there is no dictionary of the receiver"),
    serves(Of::Sentences,        "RMC",                  "time, latitude and longitude, where there is neither that nor GGA"),
    unused(Of::Sentences,        "*",                    "satellites in view and speed are no part of the position"),
    unused(Of::Location,         "Capabilities",         ability),
    serves(Of::Location,         "Enabled",              "mask; a position is asked for while satellites are enabled, which is left as it is"),
    unused(Of::Location,         "Location",             "empty unless signals are enabled; GetLocation is called instead. Its 8, the place of a CDMA base station, is not the modem's position"),
    unused(Of::Location,         "SignalsLocation",      steering),
    unused(Of::Location,         "SuplServer",           steering),
    unused(Of::Location,         "AssistanceDataServers", steering),
    unused(Of::Location,         "SupportedAssistanceData", ability),
    unused(Of::Location,         "GpsRefreshRate",       steering),

    // Modem.Signal: levels as ModemManager's own polling reports them.
    sets  (Of::GSMSignal,        "rssi",                 ServingCell, kVoxCellMonitorRSSI, power,           dBm),
    sets  (Of::UMTSSignal,       "rscp",                 ServingCell, kVoxCellMonitorRSCP, power,           dBm),
    sets  (Of::UMTSSignal,       "ecio",                 ServingCell, kVoxCellMonitorECN0, ecio,            dB),
    sets  (Of::UMTSSignal,       "rssi",                 ServingCell, kVoxCellMonitorRSSI, power,           dBm),
    sets  (Of::LTESignal,        "rsrp",                 ServingCell, kVoxCellMonitorRSRP, rsrp,            dBm),
    sets  (Of::LTESignal,        "rsrq",                 ServingCell, kVoxCellMonitorRSRQ, rsrq,            dB),
    sets  (Of::LTESignal,        "snr",                  ServingCell, kVoxCellMonitorSINR, sinr,            dB),
    sets  (Of::LTESignal,        "rssi",                 ServingCell, kVoxCellMonitorRSSI, power,           dBm),
    sets  (Of::NRSignal,         "rsrp",                 ServingCell, kVoxCellMonitorRSRP, rsrp,            dBm),
    sets  (Of::NRSignal,         "rsrq",                 ServingCell, kVoxCellMonitorRSRQ, rsrq,            dB),
    sets  (Of::NRSignal,         "snr",                  ServingCell, kVoxCellMonitorSINR, sinr,            dB),
    sets  (Of::CDMASignal,       "rssi",                 ServingCell, kVoxCellMonitorRSSI, power,           dBm),
    sets  (Of::CDMASignal,       "ecio",                 ServingCell, kVoxCellMonitorPilotStrength, ecio,   dB),
    sets  (Of::GSMSignal,        "rssi",                 Levels,   kVoxLinkRSSI,      power,                dBm),
    sets  (Of::GSMSignal,        "error-rate",           Levels,   kVoxLinkErrorRate, percent,              perCent),
    sets  (Of::UMTSSignal,       "rssi",                 Levels,   kVoxLinkRSSI,      power,                dBm),
    sets  (Of::UMTSSignal,       "rscp",                 Levels,   kVoxLinkRSCP,      power,                dBm),
    sets  (Of::UMTSSignal,       "ecio",                 Levels,   kVoxLinkECIO,      ecio,                 dB),
    sets  (Of::UMTSSignal,       "error-rate",           Levels,   kVoxLinkErrorRate, percent,              perCent),
    sets  (Of::LTESignal,        "rssi",                 Levels,   kVoxLinkRSSI,      power,                dBm),
    sets  (Of::LTESignal,        "rsrp",                 Levels,   kVoxLinkRSRP,      rsrp,                 dBm),
    sets  (Of::LTESignal,        "rsrq",                 Levels,   kVoxLinkRSRQ,      rsrq,                 dB),
    sets  (Of::LTESignal,        "snr",                  Levels,   kVoxLinkSINR,      sinr,                 dB),
    sets  (Of::LTESignal,        "error-rate",           Levels,   kVoxLinkErrorRate, percent,              perCent),
    sets  (Of::NRSignal,         "rsrp",                 Levels,   kVoxLinkRSRP,      rsrp,                 dBm),
    sets  (Of::NRSignal,         "rsrq",                 Levels,   kVoxLinkRSRQ,      rsrq,                 dB),
    sets  (Of::NRSignal,         "snr",                  Levels,   kVoxLinkSINR,      sinr,                 dB),
    sets  (Of::NRSignal,         "error-rate",           Levels,   kVoxLinkErrorRate, percent,              perCent),
    sets  (Of::CDMASignal,       "rssi",                 Levels,   kVoxLinkRSSI,      power,                dBm),
    sets  (Of::CDMASignal,       "ecio",                 Levels,   kVoxLinkECIO,      ecio,                 dB),
    sets  (Of::CDMASignal,       "error-rate",           Levels,   kVoxLinkErrorRate, percent,              perCent),
    sets  (Of::EVDOSignal,       "rssi",                 Levels,   kVoxLinkRSSI,      power,                dBm),
    sets  (Of::EVDOSignal,       "ecio",                 Levels,   kVoxLinkECIO,      ecio,                 dB),
    sets  (Of::EVDOSignal,       "sinr",                 Levels,   kVoxLinkSINR,      sinr,                 dB),
    sets  (Of::EVDOSignal,       "io",                   Levels,   kVoxLinkIO,        power,                dBm),
    sets  (Of::EVDOSignal,       "error-rate",           Levels,   kVoxLinkErrorRate, percent,              perCent),
    serves(Of::Signal,           "Rate",                 "seconds; restored after the last client"),
    unused(Of::Signal,           "RssiThreshold",        "levels are polled"),
    unused(Of::Signal,           "ErrorRateThreshold",   "levels are polled"),

    // The modem: what is in every message, and the messages of registration, link and modem.
    sets  (Of::Modem,            "State",                State,        kVoxModemState,               modemState, asNumber),
    sets  (Of::Modem,            "StateFailedReason",    State,        kVoxModemFailedReason,        known,       "enumeration, as its number, where the state is failed"),
    sets  (Of::Modem,            "UnlockRequired",       State,        kVoxModemLock,                known,       "enumeration, as its number; not those that leave the modem usable"),
    sets  (Of::Modem3gpp,        "RegistrationState",    Registration, kVoxRegistrationState,        enumeration, asNumber),
    sets  (Of::Modem3gpp,        "OperatorCode",         Registration, kVoxRegistrationPLMN,         network,     "\"MCCMNC\", unchanged"),
    sets  (Of::Modem3gpp,        "OperatorName",         Registration, kVoxRegistrationOperator,     text,        tag),
    sets  (Of::Modem3gpp,        "PacketServiceState",   Registration, kVoxRegistrationPacketService, known,      asKnown),
    serves(Of::Modem3gpp,        "InitialEpsBearer",     "path; the bearer from the attach"),
    unused(Of::Modem3gpp,        "Imei",                 "as Modem.EquipmentIdentifier"),
    unused(Of::Modem3gpp,        "EnabledFacilityLocks", steering),
    unused(Of::Modem3gpp,        "SubscriptionState",    "ModemManager does not set it any more"),
    unused(Of::Modem3gpp,        "EpsUeModeOperation",   steering),
    unused(Of::Modem3gpp,        "Pco",                  "the network's raw options, from which the bearer's addresses follow"),
    unused(Of::Modem3gpp,        "InitialEpsBearerSettings", steering),
    unused(Of::Modem3gpp,        "Nr5gRegistrationSettings", steering),
    sets  (Of::ModemCdma,        "Cdma1xRegistrationState", Registration, kVoxRegistrationCDMA1x,    known,       asKnown),
    sets  (Of::ModemCdma,        "EvdoRegistrationState", Registration, kVoxRegistrationEVDO,        known,       asKnown),
    sets  (Of::ModemCdma,        "Sid",                  Registration, kVoxRegistrationSID,          system,      "unchanged; above 32767 it is unknown"),
    sets  (Of::ModemCdma,        "Nid",                  Registration, kVoxRegistrationNID,          subnetwork,  "unchanged; above 65534 it is unknown"),
    unused(Of::ModemCdma,        "ActivationState",      "of the subscription, not of the link"),
    unused(Of::ModemCdma,        "Meid",                 "as Modem.EquipmentIdentifier"),
    unused(Of::ModemCdma,        "Esn",                  "as Modem.EquipmentIdentifier"),
    sets  (Of::Modem,            "AccessTechnologies",   Link,         kVoxLinkAccessTechnologies,   mask,            asMask),
    serves(Of::Modem,            "AccessTechnologies",   "the technology of a serving cell that is known by its place alone"),
    sets  (Of::Modem,            "SignalQuality",        Link,         kVoxLinkSignalQuality,        qualityPercent,  "the number of (per cent, recent)"),
    sets  (Of::Modem,            "SignalQuality",        Link,         kVoxLinkIsRecent,             qualityIsRecent, "the flag of (per cent, recent)"),
    sets  (Of::Modem,            "Manufacturer",         Modem,        kVoxModemManufacturer,        text,        tag),
    sets  (Of::Modem,            "Model",                Modem,        kVoxModemModel,               text,        tag),
    sets  (Of::Modem,            "Revision",             Modem,        kVoxModemRevision,            text,        tag),
    sets  (Of::Modem,            "HardwareRevision",     Modem,        kVoxModemHardware,            text,        tag),
    sets  (Of::Modem,            "EquipmentIdentifier",  Modem,        kVoxModemEquipment,           equipment,   "decimal or hexadecimal digits, unchanged"),
    sets  (Of::Modem,            "Device",               Modem,        kVoxModemDevice,              text,        tag),
    sets  (Of::Modem,            "Plugin",               Modem,        kVoxModemPlugin,              text,        tag),
    sets  (Of::Modem,            "PrimaryPort",          Modem,        kVoxModemPort,                text,        tag),
    sets  (Of::Modem,            "Drivers",              Modem,        kVoxModemDrivers,             textList,    "list of texts, unchanged"),
    sets  (Of::Modem,            "PowerState",           Modem,        kVoxModemPowerState,          known,       asKnown),
    sets  (Of::Modem,            "CurrentCapabilities",  Modem,        kVoxModemCapabilities,        mask,        asMask),
    sets  (Of::Manager,          "Version",              Modem,        kVoxModemManagerVersion,      text,        tag),
    sets  (Of::Modem,            "OwnNumbers",           SIM,          kSimFile_MSISDN,              textList,    "list of texts, unchanged, while there is a SIM"),
    serves(Of::Modem,            "Sim",                  "path; which SIM is shown, and whether there is one"),
    serves(Of::Modem,            "SimSlots",             "paths; the SIM of each slot"),
    serves(Of::Modem,            "PrimarySimSlot",       "number; the slot that is active"),
    serves(Of::Modem,            "Bearers",              "paths; which bearers are shown"),
    unused(Of::Modem,            "DeviceIdentifier",     "made of other members"),
    unused(Of::Modem,            "CarrierConfiguration", steering),
    unused(Of::Modem,            "CarrierConfigurationRevision", steering),
    unused(Of::Modem,            "Ports",                "the primary one is enough to know the modem by"),
    unused(Of::Modem,            "UnlockRetries",        "of the SIM's codes, not of the link"),
    unused(Of::Modem,            "CurrentModes",         steering),
    unused(Of::Modem,            "CurrentBands",         steering),
    unused(Of::Modem,            "SupportedCapabilities", ability),
    unused(Of::Modem,            "SupportedModes",       ability),
    unused(Of::Modem,            "SupportedBands",       ability),
    unused(Of::Modem,            "SupportedIpFamilies",  ability),
    unused(Of::Modem,            "MaxBearers",           ability),
    unused(Of::Modem,            "MaxActiveBearers",     ability),
    unused(Of::Modem,            "MaxActiveMultiplexedBearers", ability),
    unused(Of::Modem,            "StateChanged",         "a signal; the change of State that accompanies it is enough"),

    // The SIM, and the SIM of each slot.
    sets  (Of::SIM,              "SimIdentifier",        SIM,  kSimFile_ICCID,           digits,            "decimal digits, unchanged"),
    sets  (Of::SIM,              "Imsi",                 SIM,  kVoxSIMIMSI,              digits,            "decimal digits, unchanged"),
    sets  (Of::SIM,              "Eid",                  SIM,  kVoxSIMEID,               digits,            "decimal digits, unchanged"),
    sets  (Of::SIM,              "OperatorIdentifier",   SIM,  kVoxSIMOperatorCode,      network,           "\"MCCMNC\" of the issuer, unchanged"),
    sets  (Of::SIM,              "OperatorName",         SIM,  kVoxSIMOperatorName,      text,              tag),
    sets  (Of::SIM,              "Gid1",                 SIM,  kVoxSIMGroup1,            bytes,             "bytes, unchanged"),
    sets  (Of::SIM,              "Gid2",                 SIM,  kVoxSIMGroup2,            bytes,             "bytes, unchanged"),
    sets  (Of::SIM,              "EmergencyNumbers",     SIM,  kVoxSIMEmergencyNumbers,  textList,          "list of texts, unchanged"),
    sets  (Of::SIM,              "PreferredNetworks",    SIM,  kVoxSIMPreferredNetworks, preferredNetworks, "list of (\"MCCMNC\", mask) as dictionaries"),
    sets  (Of::SIM,              "SimType",              SIM,  kVoxSIMType,              known,             asKnown),
    sets  (Of::SIM,              "Active",               Slot, kVoxSIMSlotIsActive,      flag,              tag),
    sets  (Of::SIM,              "SimIdentifier",        Slot, kSimFile_ICCID,           digits,            "decimal digits, unchanged"),
    sets  (Of::SIM,              "OperatorName",         Slot, kVoxSIMOperatorName,      text,              tag),
    sets  (Of::SIM,              "OperatorIdentifier",   Slot, kVoxSIMOperatorCode,      network,           "\"MCCMNC\" of the issuer, unchanged"),
    unused(Of::SIM,              "EsimStatus",           "whether a profile is there follows from the identities"),
    unused(Of::SIM,              "Removability",         ability),

    // Bearers.
    sets  (Of::Bearer,           "Connected",            Context,   kVoxContextIsConnected,   flag,            tag),
    sets  (Of::Bearer,           "Suspended",            Context,   kVoxContextIsSuspended,   flag,            tag),
    sets  (Of::Bearer,           "BearerType",           Context,   kVoxContextType,          known,           asKnown),
    sets  (Of::Bearer,           "ProfileId",            Context,   kVoxContextProfile,       number<255>,     "number; below 0 there is none"),
    sets  (Of::BearerProperties, "apn",                  Context,   kVoxContextAPN,           text,            tag),
    sets  (Of::BearerProperties, "ip-type",              Context,   kVoxContextIPFamily,      family,          asMask),
    sets  (Of::Bearer,           "Interface",            Context,   kVoxContextInterface,     text,            tag),
    sets  (Of::Bearer,           "ConnectionError",      Context,   kVoxContextError,         error,           "(name, text) as \"name: text\""),
    sets  (Of::IPv4,             "method",               Addresses, kVoxContextMethod,        known,           asKnown),
    sets  (Of::IPv4,             "address",              Addresses, kVoxContextAddress,       internetAddress, tag),
    sets  (Of::IPv4,             "prefix",               Addresses, kVoxContextPrefix,        number<32>,      "bits"),
    sets  (Of::IPv4,             "gateway",              Addresses, kVoxContextGateway,       internetAddress, tag),
    lists (Of::IPv4,             "dns1",                 Addresses, kVoxContextDNS,           internetAddress, tag),
    lists (Of::IPv4,             "dns2",                 Addresses, kVoxContextDNS,           internetAddress, tag),
    lists (Of::IPv4,             "dns3",                 Addresses, kVoxContextDNS,           internetAddress, tag),
    sets  (Of::IPv4,             "mtu",                  Addresses, kVoxContextMTU,           packetSize, "bytes"),
    sets  (Of::IPv6,             "method",               Addresses, kVoxContextMethod,        known,           asKnown),
    sets  (Of::IPv6,             "address",              Addresses, kVoxContextAddress,       internetAddress, tag),
    sets  (Of::IPv6,             "prefix",               Addresses, kVoxContextPrefix,        number<128>,     "bits"),
    sets  (Of::IPv6,             "gateway",              Addresses, kVoxContextGateway,       internetAddress, tag),
    lists (Of::IPv6,             "dns1",                 Addresses, kVoxContextDNS,           internetAddress, tag),
    lists (Of::IPv6,             "dns2",                 Addresses, kVoxContextDNS,           internetAddress, tag),
    lists (Of::IPv6,             "dns3",                 Addresses, kVoxContextDNS,           internetAddress, tag),
    sets  (Of::IPv6,             "mtu",                  Addresses, kVoxContextMTU,           packetSize, "bytes"),
    sets  (Of::Statistics,       "uplink-speed",         Context,   kVoxContextUplinkSpeed,   speed,           "bit/s, unchanged; 0 says that none was negotiated"),
    sets  (Of::Statistics,       "downlink-speed",       Context,   kVoxContextDownlinkSpeed, speed,           "bit/s, unchanged; 0 says that none was negotiated"),
    sets  (Of::Statistics,       "start-date",           Context,   kVoxContextStart,         date,            "seconds since 1970 to a date, while connected"),
    sets  (Of::Bearer,           "Interface",            Traffic,   kVoxTrafficInterface,     text,            tag),
    sets  (Of::Statistics,       "rx-bytes",             Traffic,   kVoxTrafficReceived,      count,           "bytes, unchanged; the rate follows from it"),
    sets  (Of::Statistics,       "tx-bytes",             Traffic,   kVoxTrafficSent,          count,           "bytes, unchanged; the rate follows from it"),
    sets  (Of::Statistics,       "duration",             Traffic,   kVoxTrafficDuration,      count,           "seconds, unchanged"),
    serves(Of::Bearer,           "ReloadStatsSupported", "boolean; without it the counters stay 0 and are left out"),
    unused(Of::Statistics,       "attempts",             past),
    unused(Of::Statistics,       "failed-attempts",      past),
    unused(Of::Statistics,       "total-rx-bytes",       past),
    unused(Of::Statistics,       "total-tx-bytes",       past),
    unused(Of::Statistics,       "total-duration",       past),
    unused(Of::BearerProperties, "user",                 secret),
    unused(Of::BearerProperties, "password",             secret),
    unused(Of::BearerProperties, "*",                    steering),
    unused(Of::Bearer,           "Multiplexed",          "of the host's network interfaces, not of the link"),
    unused(Of::Bearer,           "IpTimeout",            steering),

    unused(Of::Manager,          "*",                    "it has no other members that describe a modem"),
    unused(Of::OtherInterface,   "Firmware",             steering),
    unused(Of::OtherInterface,   "Messaging",            "messages, not the link"),
    unused(Of::OtherInterface,   "ProfileManager",       steering),
    unused(Of::OtherInterface,   "Oma",                  steering),
    unused(Of::OtherInterface,   "Sar",                  steering),
    unused(Of::OtherInterface,   "Simple",               "as the other interfaces, in one answer"),
    unused(Of::OtherInterface,   "Time",                 "the network's time; messages carry the time of this machine"),
    unused(Of::OtherInterface,   "Ussd",                 "dialogues with the network, not the link"),
    unused(Of::OtherInterface,   "Voice",                "calls, not the link"),
};
// clang-format on

} // namespace

std::span<const MemberRow> memberTable() {
    return table;
}

void setKeys(Dictionary& target, MemberUse use, MemberOf of, const Dictionary& members) {
    for (const MemberRow& row : table) {
        if (row.of != of || row.use != use)
            continue;
        Value value = row.convert(members[row.member]);
        if (value.isNone())
            continue;
        if (!row.listed) {
            target.set(row.key, std::move(value));
            continue;
        }
        if (!target[row.key].asArray())
            target.set(row.key, makeArray());
        target[row.key].asArray()->append(std::move(value));
    }
}

void setKeys(Dictionary& target, MemberUse use, MemberOf of, const Value& members) {
    if (const Dictionary* dictionary = members.asDictionary())
        setKeys(target, use, of, *dictionary);
}

} // namespace velmora
