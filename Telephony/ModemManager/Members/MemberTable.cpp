// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Members/MemberTable.h"

#include "Platform/TelephonyService.h"
#include "Telephony/ModemManager/Members/LTEBand.h"
#include "Telephony/ModemManager/Members/MemberNumber.h"
#include "Telephony/ModemManager/Members/MemberText.h"

namespace velmora {
namespace {

using namespace convert;
using enum MemberUse;
using Of = MemberOf;

// Identities, and the largest that the air interface has.
constexpr auto areaCode = hexadecimalNumber<0xFFFF>;
constexpr auto trackingAreaCode = hexadecimalNumber<0xFFFFFF>;
constexpr auto gsmCellId = hexadecimalNumber<0xFFFF>;
constexpr auto longCellId = hexadecimalNumber<0xFFF'FFFF>;
constexpr auto physicalCellId = hexadecimalNumber<503>;
constexpr auto arfcn = number<1023>;
constexpr auto uarfcn = number<16383>;
constexpr auto earfcn = number<262143>;
constexpr auto scramblingCode = number<511>;
constexpr auto rscp = level<-150, 0>;
constexpr auto ecno = level<-60, 0>;

constexpr auto mccKey = kVoxCellMonitorMCC;
constexpr auto mncKey = kVoxCellMonitorMNC;
constexpr auto lacKey = kVoxCellMonitorLAC;
constexpr auto tacKey = kVoxCellMonitorTAC;
constexpr auto cellIdKey = kVoxCellMonitorCellId;

constexpr std::string_view notShown = "no section and no bearer shows it";
constexpr std::string_view secret = "a credential, which is not a measurement and stays in ModemManager";
constexpr std::string_view steering = "it configures the connection and does not describe the link";

/// A member that sets a key of a record.
constexpr MemberRow sets(Of of, std::string_view member, MemberUse use, std::string_view key,
                         Value (*conversion)(const Value&), std::string_view note) {
    return {of, member, use, key, conversion, note};
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
    serves(Of::AnyCell,          "cell-type",           "number; chooses the rows, and the radio access technology"),
    serves(Of::AnyCell,          "serving",             "boolean; the cell type, serving or neighbour"),
    sets  (Of::GSMCell,          "operator-id",         Cell,        mccKey,                      countryCode,         "first three digits of \"MCCMNC\""),
    sets  (Of::GSMCell,          "operator-id",         Cell,        mncKey,                      networkCode,         "the digits after them"),
    sets  (Of::GSMCell,          "lac",                 Cell,        lacKey,                      areaCode,            "hexadecimal text, 16 bits"),
    sets  (Of::GSMCell,          "ci",                  Cell,        cellIdKey,                   gsmCellId,           "hexadecimal text, 16 bits"),
    sets  (Of::GSMCell,          "arfcn",               Cell,        kVoxCellMonitorARFCN,        arfcn,               "unchanged"),
    sets  (Of::GSMCell,          "rx-level",            Cell,        kVoxCellMonitorRSSI,         halfStepsOfRXLEV,    "RXLEV, 1 dB up from -111 dBm, to steps of 2 dBm"),
    unused(Of::GSMCell,          "base-station-id",     "the cell information array has no key for it"),
    unused(Of::GSMCell,          "timing-advance",      "the cell information array has no key for it"),
    sets  (Of::UMTSCell,         "operator-id",         Cell,        mccKey,                      countryCode,         "first three digits of \"MCCMNC\""),
    sets  (Of::UMTSCell,         "operator-id",         Cell,        mncKey,                      networkCode,         "the digits after them"),
    sets  (Of::UMTSCell,         "lac",                 Cell,        lacKey,                      areaCode,            "hexadecimal text, 16 bits"),
    sets  (Of::UMTSCell,         "ci",                  Cell,        cellIdKey,                   longCellId,          "hexadecimal text, 28 bits"),
    sets  (Of::UMTSCell,         "uarfcn",              Cell,        kVoxCellMonitorUARFCN,       uarfcn,              "unchanged"),
    sets  (Of::UMTSCell,         "psc",                 Cell,        kVoxCellMonitorSCN,          scramblingCode,      "unchanged"),
    sets  (Of::UMTSCell,         "rscp",                Cell,        kVoxCellMonitorRSCP,         rscp,                "dBm, to the nearest whole one"),
    sets  (Of::UMTSCell,         "ecio",                Cell,        kVoxCellMonitorECN0,         ecno,                "dB, to the nearest whole one"),
    unused(Of::UMTSCell,         "frequency-fdd-ul",    "implied by the channel number"),
    unused(Of::UMTSCell,         "frequency-fdd-dl",    "implied by the channel number"),
    unused(Of::UMTSCell,         "frequency-tdd",       "implied by the channel number"),
    unused(Of::UMTSCell,         "path-loss",           "the cell information array has no key for it"),
    sets  (Of::LTECell,          "operator-id",         Cell,        mccKey,                      countryCode,         "first three digits of \"MCCMNC\""),
    sets  (Of::LTECell,          "operator-id",         Cell,        mncKey,                      networkCode,         "the digits after them"),
    sets  (Of::LTECell,          "tac",                 Cell,        tacKey,                      trackingAreaCode,    "hexadecimal text, 24 bits"),
    sets  (Of::LTECell,          "ci",                  Cell,        cellIdKey,                   longCellId,          "hexadecimal text, 28 bits"),
    sets  (Of::LTECell,          "physical-ci",         Cell,        kVoxCellMonitorPID,          physicalCellId,      "hexadecimal text, 0 to 503"),
    sets  (Of::LTECell,          "earfcn",              Cell,        kVoxCellMonitorUARFCN,       earfcn,              "unchanged; the downlink's"),
    sets  (Of::LTECell,          "earfcn",              Cell,        kVoxCellMonitorBandInfo,     bandOfEARFCN,        "the band in which the downlink channel lies"),
    unused(Of::LTECell,          "rsrp",                "the array has no key for it; Signal.Lte shows the serving cell's"),
    unused(Of::LTECell,          "rsrq",                "the array has no key for it; Signal.Lte shows the serving cell's"),
    unused(Of::LTECell,          "timing-advance",      "the cell information array has no key for it"),
    unused(Of::OtherCell,        "*",                   "CDMA, TD-SCDMA and 5G NR cells are of technologies that the live display does not have"),

    // Modem.Location.GetLocation, source 3GPP_LAC_CI: the serving cell where GetCellInfo names none.
    sets  (Of::CSLocation,       "mcc",                 Cell,        mccKey,                      decimalCode,         "decimal text"),
    sets  (Of::CSLocation,       "mnc",                 Cell,        mncKey,                      decimalCode,         "decimal text"),
    sets  (Of::CSLocation,       "lac",                 Cell,        lacKey,                      areaCode,            "hexadecimal text, 16 bits"),
    sets  (Of::CSLocation,       "ci",                  Cell,        cellIdKey,                   longCellId,          "hexadecimal text, 28 bits"),
    unused(Of::CSLocation,       "tac",                 "GSM and UMTS have no tracking areas"),
    sets  (Of::EPSLocation,      "mcc",                 Cell,        mccKey,                      decimalCode,         "decimal text"),
    sets  (Of::EPSLocation,      "mnc",                 Cell,        mncKey,                      decimalCode,         "decimal text"),
    sets  (Of::EPSLocation,      "tac",                 Cell,        tacKey,                      trackingAreaCode,    "hexadecimal text, 24 bits"),
    sets  (Of::EPSLocation,      "ci",                  Cell,        cellIdKey,                   longCellId,          "hexadecimal text, 28 bits"),
    unused(Of::EPSLocation,      "lac",                 "it is that of the fallback for calls, not of the LTE cell"),
    unused(Of::Location,         "Capabilities",        "GetLocation's answer shows whether there is a location"),
    unused(Of::Location,         "Enabled",             "as Capabilities; disabled sources stay disabled, satellites above all"),
    unused(Of::Location,         "Location",            "empty unless signals are enabled; GetLocation is called instead"),

    // Modem.Signal: levels as ModemManager's own polling reports them.
    sets  (Of::GSMSignal,        "rssi",                ServingCell, kVoxCellMonitorRSSI,         halfSteps,           "dBm to steps of 2 dBm"),
    sets  (Of::UMTSSignal,       "rscp",                ServingCell, kVoxCellMonitorRSCP,         rscp,                "dBm, to the nearest whole one"),
    sets  (Of::UMTSSignal,       "ecio",                ServingCell, kVoxCellMonitorECN0,         ecno,                "dB, to the nearest whole one"),
    sets  (Of::GSMSignal,        "rssi",                Link,        "GSM RSSI",                  powerText,           "dBm"),
    sets  (Of::GSMSignal,        "error-rate",          Link,        "GSM Bit Error Rate",        percentText,         "per cent"),
    sets  (Of::UMTSSignal,       "rssi",                Link,        "UMTS RSSI",                 powerText,           "dBm"),
    sets  (Of::UMTSSignal,       "rscp",                Link,        "UMTS RSCP",                 powerText,           "dBm"),
    sets  (Of::UMTSSignal,       "ecio",                Link,        "UMTS Ec/Io",                ratioText,           "dB"),
    sets  (Of::UMTSSignal,       "error-rate",          Link,        "UMTS Block Error Rate",     percentText,         "per cent"),
    sets  (Of::LTESignal,        "rssi",                Link,        "LTE RSSI",                  powerText,           "dBm"),
    sets  (Of::LTESignal,        "rsrp",                Link,        "LTE RSRP",                  powerText,           "dBm"),
    sets  (Of::LTESignal,        "rsrq",                Link,        "LTE RSRQ",                  ratioText,           "dB"),
    sets  (Of::LTESignal,        "snr",                 Link,        "LTE SNR",                   ratioText,           "dB"),
    sets  (Of::LTESignal,        "error-rate",          Link,        "LTE Block Error Rate",      percentText,         "per cent"),
    sets  (Of::NRSignal,         "rsrp",                Link,        "NR RSRP",                   powerText,           "dBm"),
    sets  (Of::NRSignal,         "rsrq",                Link,        "NR RSRQ",                   ratioText,           "dB"),
    sets  (Of::NRSignal,         "snr",                 Link,        "NR SNR",                    ratioText,           "dB"),
    sets  (Of::NRSignal,         "error-rate",          Link,        "NR Block Error Rate",       percentText,         "per cent"),
    unused(Of::CDMASignal,       "*",                   "the live display has no CDMA2000"),
    serves(Of::Signal,           "Rate",                "seconds; restored after the last client"),
    unused(Of::Signal,           "RssiThreshold",       "levels are polled"),
    unused(Of::Signal,           "ErrorRateThreshold",  "levels are polled"),

    // The modem, as part of every bearer's dictionary where it is shown.
    sets  (Of::Modem,            "State",               Link,        "Modem State",               modemState,          "enumeration as text"),
    sets  (Of::Modem3gpp,        "RegistrationState",   Link,        "Registration",              registrationState,   "enumeration as text"),
    sets  (Of::Modem3gpp,        "OperatorCode",        Link,        "Operator",                  networkText,         "\"MCCMNC\" as \"MCC-MNC\""),
    sets  (Of::Modem3gpp,        "OperatorName",        Link,        "Operator Name",             text,                "unchanged"),
    sets  (Of::Modem,            "AccessTechnologies",  Link,        "Access Technology",         accessTechnologies,  "mask as text"),
    sets  (Of::Modem,            "SignalQuality",       Link,        "Signal Quality",            signalQuality,       "(per cent, recent) as text"),
    serves(Of::Modem,            "AccessTechnologies",  "mask; the log technology follows it"),
    serves(Of::Modem,            "CurrentCapabilities", "mask; the log technology of a modem that has not been on a network yet"),
    serves(Of::Modem,            "Sim",                 "path; which SIM is shown, and whether there is one"),
    serves(Of::Modem,            "Bearers",             "paths; which bearers are shown"),
    serves(Of::Modem3gpp,        "InitialEpsBearer",    "path; the bearer from the attach"),
    serves(Of::Modem,            "Manufacturer",        "text, for the log"),
    serves(Of::Modem,            "Model",               "text, for the log"),
    sets  (Of::Modem,            "OwnNumbers",          SIMFile,     "kSimFile_MSISDN",           textList,            "list of texts"),
    unused(Of::Modem,            "StateChanged",        "a signal; the change of State that accompanies it is enough"),
    unused(Of::Modem,            "EquipmentIdentifier", "the phone's identity, which no section shows"),

    // The SIM. ModemManager reads few of its files, and passes on what they say instead of their bytes.
    sets  (Of::SIM,              "SimIdentifier",       SIMFile,     "kSimFile_ICCID",            digits,              "decimal digits as they stand"),
    sets  (Of::SIM,              "OperatorIdentifier",  SIMFile,     "kSimFile_AHPLMN",           networkText,         "\"MCCMNC\" of the issuer, which is the home network, as \"MCC-MNC\""),
    sets  (Of::SIM,              "OperatorName",        SIMFile,     "kSimFile_PNN",              text,                "the network's name as the SIM gives it"),
    sets  (Of::SIM,              "PreferredNetworks",   SIMFile,     "kSimFile_OPLMNAcT",         preferredNetworks,   "list of (\"MCCMNC\", mask) as text"),
    unused(Of::SIM,              "Imsi",                "the display has no SIM file of it, and it names the subscriber"),
    unused(Of::SIM,              "EmergencyNumbers",    "the display has no SIM file of it"),
    unused(Of::SIM,              "Gid1",                "the display has no SIM file of it"),
    unused(Of::SIM,              "Gid2",                "the display has no SIM file of it"),
    unused(Of::SIM,              "Eid",                 "the display has no SIM file of it"),
    unused(Of::SIM,              "Active",              "the modem's Sim is the active one"),

    // Bearers: all is text for people.
    sets  (Of::Bearer,           "Connected",           Bearer,      "State",                     bearerState,         "boolean as text"),
    sets  (Of::Bearer,           "Suspended",           Bearer,      "Suspended",                 yesOrNo,             "boolean as text"),
    sets  (Of::Bearer,           "BearerType",          Bearer,      "Type",                      bearerType,          "enumeration as text"),
    sets  (Of::Bearer,           "ProfileId",           Bearer,      "Context ID",                numberText,          "number; below 0 there is none"),
    sets  (Of::BearerProperties, "apn",                 Bearer,      "APN",                       text,                "unchanged"),
    sets  (Of::BearerProperties, "ip-type",             Bearer,      "PDP Type",                  internetFamily,      "mask as text"),
    sets  (Of::Bearer,           "Interface",           Bearer,      "Interface",                 text,                "unchanged"),
    sets  (Of::IPv4,             "method",              Bearer,      "IPv4 Method",               configurationMethod, "enumeration as text"),
    sets  (Of::IPv4,             "address",             Bearer,      "PDP Address",               internetAddress,     "unchanged"),
    sets  (Of::IPv4,             "prefix",              Bearer,      "IPv4 Prefix Length",        numberText,          "bits"),
    sets  (Of::IPv4,             "gateway",             Bearer,      "IPv4 Gateway",              internetAddress,     "unchanged"),
    sets  (Of::IPv4,             "dns1",                Bearer,      "Primary DNS",               internetAddress,     "unchanged"),
    sets  (Of::IPv4,             "dns2",                Bearer,      "Secondary DNS",             internetAddress,     "unchanged"),
    unused(Of::IPv4,             "dns3",                "two are as many as a context names"),
    sets  (Of::IPv4,             "mtu",                 Bearer,      "IPv4 MTU",                  byteCount,           "bytes"),
    sets  (Of::IPv6,             "method",              Bearer,      "IPv6 Method",               configurationMethod, "enumeration as text"),
    sets  (Of::IPv6,             "address",             Bearer,      "PDP Address (IPv6)",        internetAddress,     "unchanged"),
    sets  (Of::IPv6,             "prefix",              Bearer,      "IPv6 Prefix Length",        numberText,          "bits"),
    sets  (Of::IPv6,             "gateway",             Bearer,      "IPv6 Gateway",              internetAddress,     "unchanged"),
    sets  (Of::IPv6,             "dns1",                Bearer,      "Primary DNS (IPv6)",        internetAddress,     "unchanged"),
    sets  (Of::IPv6,             "dns2",                Bearer,      "Secondary DNS (IPv6)",      internetAddress,     "unchanged"),
    unused(Of::IPv6,             "dns3",                "two are as many as a context names"),
    sets  (Of::IPv6,             "mtu",                 Bearer,      "IPv6 MTU",                  byteCount,           "bytes"),
    sets  (Of::Statistics,       "uplink-speed",        Bearer,      "Maximum Bit Rate Uplink",   bitRate,             "bit/s to kbit/s"),
    sets  (Of::Statistics,       "downlink-speed",      Bearer,      "Maximum Bit Rate Downlink", bitRate,             "bit/s to kbit/s"),
    sets  (Of::Statistics,       "start-date",          Bearer,      "Connected Since",           dateText,            "seconds since 1970 to date and time"),
    sets  (Of::Statistics,       "duration",            Bearer,      "Duration",                  seconds,             "seconds"),
    sets  (Of::Statistics,       "rx-bytes",            Bearer,      "Received",                  byteCount,           "bytes"),
    sets  (Of::Statistics,       "tx-bytes",            Bearer,      "Sent",                      byteCount,           "bytes"),
    unused(Of::Statistics,       "attempts",            "of the bearer's past, not of the connection"),
    unused(Of::Statistics,       "failed-attempts",     "of the bearer's past, not of the connection"),
    unused(Of::Statistics,       "total-rx-bytes",      "of the bearer's past, not of the connection"),
    unused(Of::Statistics,       "total-tx-bytes",      "of the bearer's past, not of the connection"),
    unused(Of::Statistics,       "total-duration",      "of the bearer's past, not of the connection"),
    unused(Of::BearerProperties, "user",                secret),
    unused(Of::BearerProperties, "password",            secret),
    unused(Of::BearerProperties, "allowed-auth",        steering),
    unused(Of::BearerProperties, "allow-roaming",       steering),
    unused(Of::BearerProperties, "profile-id",          "as ProfileId"),
    unused(Of::Bearer,           "ConnectionError",     notShown),
    unused(Of::Bearer,           "Multiplexed",         notShown),
    unused(Of::Bearer,           "IpTimeout",           steering),

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
        if (Value value = row.convert(members[row.member]); !value.isNone())
            target.set(row.key, std::move(value));
    }
}

void setKeys(Dictionary& target, MemberUse use, MemberOf of, const Value& members) {
    if (const Dictionary* dictionary = members.asDictionary())
        setKeys(target, use, of, *dictionary);
}

} // namespace velmora
