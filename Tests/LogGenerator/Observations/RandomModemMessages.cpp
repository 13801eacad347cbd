// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Observations/RandomModemMessages.h"

#include "LogMessages/LiveModem.h"
#include "LogMessages/LogMessage.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Support/Hex.h"

#include <iterator>
#include <limits>

namespace velmora {

namespace {

constexpr std::string_view cellKeys[] = {
    kVoxCellMonitorMCC,           kVoxCellMonitorMNC,
    kVoxCellMonitorMNCDigits,     kVoxCellMonitorLAC,
    kVoxCellMonitorTAC,           kVoxCellMonitorCellId,
    kVoxCellMonitorARFCN,         kVoxCellMonitorUARFCN,
    kVoxCellMonitorEARFCN,        kVoxCellMonitorNRARFCN,
    kVoxCellMonitorPID,           kVoxCellMonitorSCN,
    kVoxCellMonitorBSIC,          kVoxCellMonitorRSSI,
    kVoxCellMonitorRSCP,          kVoxCellMonitorECN0,
    kVoxCellMonitorRSRP,          kVoxCellMonitorRSRQ,
    kVoxCellMonitorSINR,          kVoxCellMonitorPathLoss,
    kVoxCellMonitorTimingAdvance, kVoxCellMonitorDownlinkFrequency,
    kVoxCellMonitorBandwidth,     kVoxCellMonitorUplinkFrequency,
    kVoxCellMonitorSID,           kVoxCellMonitorNID,
    kVoxCellMonitorBaseStation,   kVoxCellMonitorPN,
    kVoxCellMonitorPilotStrength,
};
constexpr std::string_view technologies[] = {
    kVoxCellMonitorRadioAccessTechnologyGSM,   kVoxCellMonitorRadioAccessTechnologyUMTS,
    kVoxCellMonitorRadioAccessTechnologyUTRAN, kVoxCellMonitorRadioAccessTechnologyLTE,
    kVoxCellMonitorRadioAccessTechnologyNR,    kVoxCellMonitorRadioAccessTechnologyCDMA,
};
constexpr std::string_view linkKeys[] = {kVoxLinkRSSI, kVoxLinkRSCP, kVoxLinkECIO, kVoxLinkRSRP,
                                         kVoxLinkRSRQ, kVoxLinkSINR, kVoxLinkIO,   kVoxLinkErrorRate};
constexpr std::string_view linkTechnologies[] = {kVoxLinkGSM, kVoxLinkUMTS, kVoxLinkLTE,
                                                 kVoxLinkNR,  kVoxLinkCDMA, kVoxLinkEVDO};
constexpr std::string_view contextKeys[] = {
    kVoxContextBearer,      kVoxContextIsConnected, kVoxContextIsSuspended,   kVoxContextType,
    kVoxContextProfile,     kVoxContextAPN,         kVoxContextIPFamily,      kVoxContextInterface,
    kVoxContextUplinkSpeed, kVoxContextError,       kVoxContextDownlinkSpeed, kVoxContextStart,
};
constexpr std::string_view addressKeys[] = {kVoxContextMethod,  kVoxContextAddress, kVoxContextPrefix,
                                            kVoxContextGateway, kVoxContextDNS,     kVoxContextMTU};
constexpr std::string_view trafficKeys[] = {
    kVoxTrafficBearer,   kVoxTrafficInterface,    kVoxTrafficReceived,   kVoxTrafficSent,
    kVoxTrafficDuration, kVoxTrafficDownlinkRate, kVoxTrafficUplinkRate, kVoxTrafficInterval};
constexpr std::string_view slotKeys[] = {kVoxSIMSlotNumber, kVoxSIMSlotIsActive, kVoxSIMSlotHasSIM,
                                         kSimFile_ICCID,    kVoxSIMOperatorName, kVoxSIMOperatorCode};
constexpr std::string_view networkKeys[] = {kVoxSIMOperatorCode, kVoxLinkAccessTechnologies};
/// Those whose values are no dictionaries and no rows.
constexpr std::string_view plainKeys[] = {
    kVoxModemReason,
    kVoxModemCellsLeftOut,
    kVoxRegistrationState,
    kVoxRegistrationPLMN,
    kVoxRegistrationOperator,
    kVoxRegistrationPacketService,
    kVoxRegistrationCDMA1x,
    kVoxRegistrationEVDO,
    kVoxRegistrationSID,
    kVoxRegistrationNID,
    kVoxLinkAccessTechnologies,
    kVoxLinkSignalQuality,
    kVoxLinkIsRecent,
    kSimFile_ICCID,
    kSimFile_MSISDN,
    kVoxSIMIMSI,
    kVoxSIMEID,
    kVoxSIMOperatorCode,
    kVoxSIMOperatorName,
    kVoxSIMGroup1,
    kVoxSIMGroup2,
    kVoxSIMEmergencyNumbers,
    kVoxSIMType,
    kVoxModemIndex,
    kVoxModemManufacturer,
    kVoxModemModel,
    kVoxModemRevision,
    kVoxModemHardware,
    kVoxModemEquipment,
    kVoxModemDevice,
    kVoxModemPlugin,
    kVoxModemPort,
    kVoxModemDrivers,
    kVoxModemPowerState,
    kVoxModemCapabilities,
    kVoxModemManagerVersion,
    kVoxPositionLatitude,
    kVoxPositionLongitude,
    kVoxPositionAltitude,
    kVoxPositionTime,
    kVoxContexts,
    kVoxTraffic,
    kVoxSIMSlots,
    kVoxCellMonitorCells,
};

} // namespace

std::int64_t RandomModemMessages::between(std::int64_t least, std::int64_t most) {
    return std::uniform_int_distribution<std::int64_t>(least, most)(_random);
}

Value RandomModemMessages::number() {
    switch (between(0, 10)) {
    case 0: return between(0, 3);
    case 1: return between(-1, 20);
    case 2: return between(0, 1100);
    case 3: return between(0, 70000);
    case 4: return between(0, 4'000'000);
    case 5: return between(-140, 10);
    case 6: return static_cast<double>(between(-1400, 10)) / 10;
    case 7: return between(0, std::int64_t{1} << 37);
    case 8: return static_cast<double>(between(-400, 400)) / 16;
    case 9: return static_cast<std::int64_t>(_random());
    default: {
        constexpr double odd[] = {std::numeric_limits<double>::quiet_NaN(),
                                  std::numeric_limits<double>::infinity(), 1e300, 2147483647};
        return odd[between(0, std::ssize(odd) - 1)];
    }
    }
}

Value RandomModemMessages::text() {
    constexpr std::string_view texts[] = {"", "00101", "310260", "internet", "10.0.0.2", "+1234", "7"};
    return texts[static_cast<std::size_t>(between(0, std::ssize(texts) - 1))];
}

Value RandomModemMessages::textList() {
    const ArrayRef list = makeArray();
    for (std::int64_t i = between(0, 3); i > 0; --i)
        list->append(oneOf(5) ? number() : text());
    return list;
}

Value RandomModemMessages::any() {
    switch (between(0, 9)) {
    case 0: return oneOf(2);
    case 1: return textList();
    case 2: return Data(std::vector<std::uint8_t>(static_cast<std::size_t>(between(0, 3)), 0xA5));
    case 3: return Date(std::chrono::seconds(between(0, 2'000'000'000)));
    case 4:
    case 5:
    case 6: return text();
    default: return number();
    }
}

DictionaryRef RandomModemMessages::some(std::span<const std::string_view> keys) {
    DictionaryRef result = makeDictionary();
    const std::int64_t rarity = between(1, 3);
    for (const std::string_view key : keys)
        if (oneOf(static_cast<int>(rarity)))
            result->set(key, any());
    return result;
}

Value RandomModemMessages::rows(std::span<const std::string_view> keys) {
    const ArrayRef list = makeArray();
    for (std::int64_t i = between(0, 4); i > 0; --i)
        list->append(oneOf(10) ? any() : Value(some(keys)));
    return list;
}

Value RandomModemMessages::cell() {
    if (oneOf(20))
        return any();
    const DictionaryRef result = makeDictionary();
    result->set(kVoxCellMonitorCellRadioAccessTechnology,
                oneOf(20) ? text() : Value(technologies[static_cast<std::size_t>(between(0, 5))]));
    result->set(kVoxCellMonitorCellType,
                oneOf(2) ? kVoxCellMonitorCellTypeServing : kVoxCellMonitorCellTypeNeighbor);
    for (const std::string_view key : cellKeys)
        if (!oneOf(3))
            result->set(key, oneOf(20) ? any() : number());
    if (oneOf(4))
        result->set(kVoxCellMonitorIsPlace, oneOf(2));
    return result;
}

Value RandomModemMessages::contexts() {
    const Value list = rows(contextKeys);
    for (const Value& each : *list.asArray())
        if (Dictionary* const context = each.asDictionary()) {
            context->set(kVoxContextIPv4, some(addressKeys));
            context->set(kVoxContextIPv6, oneOf(5) ? any() : Value(some(addressKeys)));
        }
    return list;
}

Data RandomModemMessages::next() {
    const auto code = static_cast<std::uint16_t>(between(0, 7));
    if (oneOf(40))
        return recordOf(code, *writeBinaryPropertyList(any()), LogMessage::extraType);
    const DictionaryRef message = some(plainKeys);
    if (oneOf(10))
        message->set(kVoxModemPresence, between(0, 8));
    for (const std::string_view key : {kVoxModemState, kVoxModemFailedReason, kVoxModemLock})
        if (!oneOf(3))
            message->set(key, oneOf(8) ? any() : Value(between(-1, 14)));
    for (const std::string_view key : {kVoxModemCellReport, kVoxModemNeighborReport})
        if (oneOf(3))
            message->set(key, between(0, 5));
    for (const std::string_view key : linkTechnologies)
        if (oneOf(2))
            message->set(key, some(linkKeys));
    if (!oneOf(10)) {
        const ArrayRef cells = makeArray();
        for (std::int64_t i = between(0, 8); i > 0; --i)
            cells->append(cell());
        message->set(kVoxCellMonitorCells, cells);
        message->set(kVoxContexts, contexts());
        message->set(kVoxTraffic, rows(trafficKeys));
        message->set(kVoxSIMSlots, rows(slotKeys));
        message->set(kVoxSIMPreferredNetworks, rows(networkKeys));
    }
    return recordOf(code, *writeBinaryPropertyList(message), LogMessage::extraType);
}

} // namespace velmora
