// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Observations/RandomMessages.h"

#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Support/Hex.h"

#include <algorithm>
#include <chrono>
#include <iterator>
#include <string>

namespace velmora {

namespace {

constexpr std::string_view cellKeys[] = {
    kVoxCellMonitorMCC,      kVoxCellMonitorMNC,   kVoxCellMonitorLAC,    kVoxCellMonitorTAC,
    kVoxCellMonitorCellId,   kVoxCellMonitorARFCN, kVoxCellMonitorPID,    kVoxCellMonitorSCN,
    kVoxCellMonitorRSSI,     kVoxCellMonitorRSCP,  kVoxCellMonitorUARFCN, kVoxCellMonitorECN0,
    kVoxCellMonitorBandInfo,
};
constexpr std::string_view radioTechnologies[] = {
    kVoxCellMonitorRadioAccessTechnologyGSM, kVoxCellMonitorRadioAccessTechnologyUMTS,
    kVoxCellMonitorRadioAccessTechnologyUTRAN, kVoxCellMonitorRadioAccessTechnologyLTE};
constexpr std::string_view cellTypes[] = {kVoxCellMonitorCellTypeServing, kVoxCellMonitorCellTypeNeighbor};
constexpr std::string_view contextLabels[] = {"Context ID",
                                              "NSAPI",
                                              "APN",
                                              "PDP Type",
                                              "PDP Address",
                                              "Primary DNS",
                                              "Secondary DNS",
                                              "QoS Traffic Class",
                                              "Maximum Bit Rate Uplink",
                                              "Maximum Bit Rate Downlink",
                                              "Something New"};
constexpr std::string_view simKeys[] = {
    "kSimFile_ICCID",   "kSimFile_MSISDN", "kSimFile_MBDN", "kSimFile_HPPLMN",   "kSimFile_LOCI",
    "kSimFile_PSLOCI",  "kSimFile_ACC",    "kSimFile_AD",   "kSimFile_FPLMN",    "kSimFile_AHPLMN",
    "kSimFile_RATMODE", "kSimFile_PNN",    "kSimFile_OPL",  "kSimFile_OPLMNAcT", "kSimFile_Unknown"};

constexpr std::string_view treeKeys[] = {"SIM", "ICCID", "Registration", "State", "Serving Cell", "RxLev"};
constexpr std::string_view treeTexts[] = {"-71 dBm", "12", "07",    "-3 dB",
                                          "none",    "",   "2.5 %", "89010000000000000011"};

} // namespace

RandomMessages::RandomMessages(const LogGenerator& decoder, std::vector<Data> drive, std::uint64_t seed)
    : _random(seed), _drive(std::move(drive)) {
    const DictionaryRef command = decoder.getStartCommand();
    if (const Array* const codes = (*command)["SetOstrelLogCodes"].asArray())
        for (const Value& code : *codes)
            _codes.push_back(static_cast<std::uint16_t>(*code.asInteger()));
    _hasService = command->contains("SetVoxExtraCodes");
    if (decoder.technology() == kVoxLogChannelTechnology_Modem)
        _ofModem.emplace(seed);
}

std::int64_t RandomMessages::between(std::int64_t least, std::int64_t most) {
    return std::uniform_int_distribution<std::int64_t>(least, most)(_random);
}

std::uint8_t RandomMessages::byte() {
    switch (_contents) {
    case 0: return static_cast<std::uint8_t>(between(0, 3));
    case 1: return between(0, 3) == 0 ? 0xFF : static_cast<std::uint8_t>(between(0, 12));
    default: return static_cast<std::uint8_t>(between(0, 255));
    }
}

Data RandomMessages::next() {
    if (_ofModem)
        return between(0, 2) == 0 ? changedMessage() : _ofModem->next();
    if (_codes.empty())
        return Data(*writeBinaryPropertyList(tree(3)));
    const std::int64_t choice = between(0, 9);
    if (choice < 4)
        return randomRecord();
    return choice < 8 || !_hasService ? changedMessage() : serviceRecord();
}

Data RandomMessages::randomRecord() {
    _contents = static_cast<int>(between(0, 2));
    std::vector<std::uint8_t> payload(static_cast<std::size_t>(between(0, between(0, 3) == 0 ? 400 : 60)));
    std::generate(payload.begin(), payload.end(), [this] { return byte(); });
    return recordOf(_codes[static_cast<std::size_t>(between(0, std::ssize(_codes) - 1))], payload);
}

Data RandomMessages::changedMessage() {
    _contents = static_cast<int>(between(0, 2));
    const Data& chosen = _drive[static_cast<std::size_t>(between(0, std::ssize(_drive) - 1))];
    std::vector<std::uint8_t> bytes(chosen.bytes().begin(), chosen.bytes().end());
    for (std::int64_t i = between(0, 8); i > 0 && !bytes.empty(); --i)
        bytes[static_cast<std::size_t>(between(0, std::ssize(bytes) - 1))] = byte();
    if (between(0, 5) == 0)
        bytes.resize(static_cast<std::size_t>(between(0, std::ssize(bytes) + 20)));
    return Data(std::move(bytes));
}

Data RandomMessages::serviceRecord() {
    const ArrayRef list = makeArray();
    const std::int64_t entries = between(0, 5);
    switch (between(0, 2)) {
    case 0: return extraRecord(0, simFiles());
    case 1:
        for (std::int64_t i = 0; i < entries; ++i)
            list->append(cell());
        return extraRecord(1, list);
    default:
        for (std::int64_t i = 0; i < entries; ++i)
            list->append(between(0, 5) == 0 ? anything(2) : context());
        return extraRecord(2, list);
    }
}

Value RandomMessages::cell() {
    const DictionaryRef result = makeDictionary();
    result->set(kVoxCellMonitorCellRadioAccessTechnology,
                radioTechnologies[static_cast<std::size_t>(between(0, 3))]);
    result->set(kVoxCellMonitorCellType, cellTypes[static_cast<std::size_t>(between(0, 1))]);
    constexpr std::int64_t notMeasured = 32767;
    for (const std::string_view key : cellKeys)
        switch (between(0, 4)) {
        case 0: break;
        case 1: result->set(key, between(-120, -20)); break;
        case 2: result->set(key, between(0, 1) == 0 ? notMeasured : between(-40000, 70000)); break;
        case 3: result->set(key, static_cast<std::int64_t>(_random())); break;
        default: result->set(key, between(0, 999)); break;
        }
    return result;
}

Value RandomMessages::context() {
    const DictionaryRef result = makeDictionary();
    for (const std::string_view label : contextLabels)
        if (between(0, 2) != 0)
            result->set(label, between(0, 9) == 0 ? anything(1) : Value(std::to_string(between(0, 9))));
    return result;
}

Value RandomMessages::simFiles() {
    const DictionaryRef result = makeDictionary();
    for (const std::string_view key : simKeys)
        if (between(0, 2) != 0)
            result->set(key, anything(2));
    return result;
}

Value RandomMessages::tree(int depth) {
    const std::int64_t entries = between(0, 4);
    if (depth < 3 && (depth == 0 || between(0, 1) == 0))
        return treeTexts[static_cast<std::size_t>(between(0, std::ssize(treeTexts) - 1))];
    if (depth < 3 && between(0, 3) == 0) {
        const ArrayRef list = makeArray();
        for (std::int64_t i = 0; i < entries; ++i)
            list->append(tree(depth - 1));
        return list;
    }
    const DictionaryRef dictionary = makeDictionary();
    for (std::int64_t i = 0; i < entries; ++i)
        dictionary->set(treeKeys[static_cast<std::size_t>(between(0, std::ssize(treeKeys) - 1))],
                        tree(depth - 1));
    return dictionary;
}

Value RandomMessages::anything(int depth) {
    const std::int64_t entries = between(0, 3);
    switch (between(0, depth > 0 ? 9 : 7)) {
    case 0: return between(-1000, 1000);
    case 1: return between(0, 1) == 0;
    case 2: return Data(std::vector<std::uint8_t>(static_cast<std::size_t>(entries), 7));
    case 3: return static_cast<double>(between(-1000, 1000)) / 8;
    case 8: {
        const ArrayRef list = makeArray();
        for (std::int64_t i = 0; i < entries; ++i)
            list->append(anything(depth - 1));
        return list;
    }
    case 9: {
        const DictionaryRef dictionary = makeDictionary();
        for (std::int64_t i = 0; i < entries; ++i)
            dictionary->set("Key " + std::to_string(between(0, 4)), anything(depth - 1));
        return dictionary;
    }
    case 4: return Date(std::chrono::seconds(between(0, 2'000'000'000)));
    default: return std::to_string(between(-5, 99999));
    }
}

} // namespace velmora
