// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogCodes.h"

#include "LogMessages/LogMessage.h"
#include "Platform/TelephonyService.h"

#include <algorithm>
#include <iterator>

namespace velmora {

namespace {

constexpr std::uint8_t gsm = 1;
constexpr std::uint8_t cdma = 2;
constexpr std::uint8_t lte = 4;
constexpr std::uint8_t utran = 8;

struct Row {
    std::uint32_t code;
    std::uint8_t technologies;
};

constexpr Row rows[] = {
    {0x108A, cdma},
    {0x1183, cdma},
    {0x1192, cdma},
    {0x119C, cdma},
    {0x119D, cdma},
    {0x127E, cdma},
    {0x12B6, cdma},
    {0x134F, cdma},
    {0x4005, gsm},
    {0x4031, gsm},
    {0x4116, gsm},
    {0x4125, gsm},
    {0x4127, gsm},
    {0x4157, gsm},
    {0x417A, gsm},
    {0x4221, gsm},
    {0x5072, gsm},
    {0x5076, gsm},
    {0x512C, gsm},
    {0x5134, gsm},
    {0x5137, gsm},
    {0x51F4, gsm},
    {0x51F5, gsm},
    {0x51F6, gsm},
    {0x51F8, gsm},
    {0x51FB, gsm},
    {0x51FD, gsm},
    {0x51FF, gsm},
    {0x7130, gsm},
    {0x7131, gsm},
    {0x7132, gsm},
    {0x7135, gsm},
    {0x7150, gsm},
    {0xB0C1, lte},
    {0xB0C2, lte},
    {0xB179, lte},
    {0xB17F, lte},
    {0xB180, lte},
    {0xB186, lte},
    {0xD00A, utran},
    {0xD00C, utran},
    {0xD00E, utran},
    {0xD0E0, utran},
    {0xD0E2, utran},
    {ExtraCode::simFiles, gsm | lte | utran},
    {ExtraCode::cellInformation, gsm | lte | utran},
    {ExtraCode::packetDataContexts, gsm | lte | utran},
};

constexpr auto before = [](const Row& a, const Row& b) { return a.code < b.code; };
static_assert(std::is_sorted(std::begin(rows), std::end(rows), before));

} // namespace

std::uint8_t technologiesOfCode(std::uint32_t logCode) {
    const Row* const row = std::lower_bound(std::begin(rows), std::end(rows), Row{logCode, 0}, before);
    return row != std::end(rows) && row->code == logCode ? row->technologies : std::uint8_t{0};
}

std::string_view technologyOfBit(unsigned bit) {
    constexpr std::string_view constants[technologyBits] = {
        kVoxLogChannelTechnology_Ostrel_GSM, kVoxLogChannelTechnology_Ostrel_CDMA,
        kVoxLogChannelTechnology_Ostrel_LTE, kVoxLogChannelTechnology_Ostrel_UTRAN2};
    return shortTechnologyName(constants[bit]);
}

} // namespace velmora
