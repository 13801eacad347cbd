// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/ServiceRecords.h"

#include "LogMessages/LogMessage.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"

#include <stdexcept>
#include <string>

namespace velmora::records {
namespace {

/// A record whose payload is that property list.
RecordBuilder withPayload(std::uint32_t extraCode, const Value& root, bool binary) {
    if (binary) {
        const auto payload = writeBinaryPropertyList(root);
        if (!payload)
            throw std::logic_error("payload cannot be written: " + payload.reason());
        return RecordBuilder(extraCode, Bytes(*payload));
    }
    const auto payload = writeXMLPropertyList(root);
    if (!payload)
        throw std::logic_error("payload cannot be written: " + payload.reason());
    return RecordBuilder(extraCode,
                         Bytes(reinterpret_cast<const std::uint8_t*>(payload->data()), payload->size()));
}

Value arrayOf(const std::vector<DictionaryRef>& dictionaries) {
    const ArrayRef array = makeArray();
    for (const DictionaryRef& each : dictionaries)
        array->append(Value(each));
    return Value(array);
}

DictionaryRef cellCommon(std::string_view technology, const CellArea& area, bool serving) {
    return std::make_shared<Dictionary>(Dictionary{
        {std::string(kVoxCellMonitorCellRadioAccessTechnology), technology},
        {std::string(kVoxCellMonitorCellType),
         serving ? kVoxCellMonitorCellTypeServing : kVoxCellMonitorCellTypeNeighbor},
        {std::string(kVoxCellMonitorMCC), area.plmn.mcc},
        {std::string(kVoxCellMonitorMNC), area.plmn.mnc},
        {std::string(kVoxCellMonitorLAC), area.lac},
    });
}

} // namespace

RecordBuilder simFiles(const Dictionary& files, bool binary) {
    return withPayload(ExtraCode::simFiles, Value(std::make_shared<Dictionary>(files)), binary);
}

RecordBuilder cellInformation(const std::vector<DictionaryRef>& cells, bool binary) {
    return withPayload(ExtraCode::cellInformation, arrayOf(cells), binary);
}

RecordBuilder packetContexts(const std::vector<DictionaryRef>& contexts, bool binary) {
    return withPayload(ExtraCode::packetDataContexts, arrayOf(contexts), binary);
}

DictionaryRef gsmCellInformation(const GSMMeasurement& cell, bool serving) {
    DictionaryRef each = cellCommon(kVoxCellMonitorRadioAccessTechnologyGSM, cell.cell->area, serving);
    each->set(kVoxCellMonitorCellId, cell.cell->cellId);
    each->set(kVoxCellMonitorARFCN, cell.cell->arfcn);
    each->set(kVoxCellMonitorRSSI, cell.rssi_dBm / 2); // in steps of two decibels
    each->set(kVoxCellMonitorBandInfo, cell.cell->arfcn < 512 ? 900 : 1800);
    return each;
}

DictionaryRef umtsCellInformation(const UMTSMeasurement& cell, bool serving) {
    DictionaryRef each = cellCommon(kVoxCellMonitorRadioAccessTechnologyUMTS, cell.cell->area, serving);
    each->set(kVoxCellMonitorCellId, cell.cell->cellId);
    each->set(kVoxCellMonitorUARFCN, cell.cell->uarfcn);
    each->set(kVoxCellMonitorSCN, cell.cell->scramblingCode);
    each->set(kVoxCellMonitorRSCP, cell.rscp_dBm);
    each->set(kVoxCellMonitorECN0, static_cast<int>(cell.ecno_dB));
    each->set(kVoxCellMonitorBandInfo, 1);
    return each;
}

DictionaryRef utranCellInformation(const UTRANMeasurement& cell, bool serving) {
    DictionaryRef each = cellCommon(kVoxCellMonitorRadioAccessTechnologyUTRAN, cell.cell.area, serving);
    each->set(kVoxCellMonitorCellId, cell.cell.cellId);
    each->set(kVoxCellMonitorUARFCN, cell.cell.uarfcn);
    each->set(kVoxCellMonitorSCN, cell.cell.parameterId);
    each->set(kVoxCellMonitorRSCP, cell.rscp_dBm);
    each->set(kVoxCellMonitorBandInfo, 1); // 1900-1920 and 2010-2025 MHz
    return each;
}

DictionaryRef lteCellInformation(const LTEMeasurement& cell, bool serving) {
    DictionaryRef each = cellCommon(kVoxCellMonitorRadioAccessTechnologyLTE, cell.cell.area, serving);
    each->remove(kVoxCellMonitorLAC); // it has a tracking area in its place
    each->set(kVoxCellMonitorTAC, cell.cell.area.lac);
    each->set(kVoxCellMonitorCellId, cell.cell.identity);
    each->set(kVoxCellMonitorUARFCN, lteCarriers[cell.cell.carrier].downlink);
    each->set(kVoxCellMonitorPID, cell.cell.physicalId);
    each->set(kVoxCellMonitorBandInfo, lteCarriers[cell.cell.carrier].band);
    return each;
}

DictionaryRef testSIM(const CellArea& lastArea, const DriveIdentities& identities) {
    return std::make_shared<Dictionary>(Dictionary{
        {"kSimFile_ICCID", identities.sims[0].iccid},
        {"kSimFile_MSISDN", identities.sims[0].number},
        {"kSimFile_MBDN", identities.mailbox},
        {"kSimFile_HPPLMN", "60 min"},
        {"kSimFile_LOCI", "001-01, LAC " + std::to_string(lastArea.lac) + ", updated"},
        {"kSimFile_PSLOCI", "001-01, LAC " + std::to_string(lastArea.lac) + ", RAC " +
                                std::to_string(lastArea.rac) + ", updated"},
        {"kSimFile_ACC", "0x0080 (class 7)"},
        {"kSimFile_AD", "00 00 00 02"},
        {"kSimFile_FPLMN", "999-99"},
        {"kSimFile_AHPLMN", "001-01"},
        {"kSimFile_RATMODE", "Automatic"},
        {"kSimFile_PNN", "Test Network"},
        {"kSimFile_OPL", "001-01, LAC 0-65534, PNN 1"},
        {"kSimFile_OPLMNAcT", "001-02 (UTRAN, GSM)"},
    });
}

DictionaryRef testContext(int number, const DriveIdentities& identities) {
    const bool internet = number == 1;
    const std::string& addresses = internet ? identities.addresses : identities.addresses6;
    return std::make_shared<Dictionary>(Dictionary{
        {"Context ID", std::to_string(number)},
        {"NSAPI", std::to_string(4 + number)},
        {"APN", internet ? "internet.test" : "mms.test"},
        {"PDP Type", internet ? "IPv4" : "IPv6"},
        {"PDP Address", addresses + "17"},
        {"Primary DNS", addresses + "1"},
        {"QoS Traffic Class", internet ? "Interactive" : "Background"},
        {"Maximum Bit Rate Uplink", "384 kbit/s"},
        {"Maximum Bit Rate Downlink", "7168 kbit/s"},
    });
}

} // namespace velmora::records
