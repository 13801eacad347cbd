// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/RegistrationRecords.h"

#include <array>

namespace velmora::records {
namespace {

std::array<int, 3> digitsOf(int number) {
    return {number / 100 % 10, number / 10 % 10, number % 10};
}

} // namespace

RecordBuilder gmmState(GMMState state, GMMSubState subState, UpdateStatus status) {
    return RecordBuilder(0x7130, 16)
        .u8(13, static_cast<int>(state))
        .u8(14, static_cast<int>(subState))
        .u8(15, static_cast<int>(status));
}

RecordBuilder mmState(MMState state, MMSubState subState, UpdateStatus status) {
    return RecordBuilder(0x7131, 16)
        .u8(13, static_cast<int>(state))
        .u8(14, static_cast<int>(subState))
        .u8(15, static_cast<int>(status));
}

RecordBuilder registrationState(RegistrationState state) {
    return RecordBuilder(0x7132, 16).u8(13, static_cast<int>(state)).u8(14, 0);
}

RecordBuilder servingNetwork(int operatingMode, ServiceType service, const CellArea& area) {
    const auto mcc = digitsOf(area.plmn.mcc);
    const auto mnc = digitsOf(area.plmn.mnc);
    constexpr int filler = 0xF; // these networks have two-digit MNCs
    return RecordBuilder(0x7135, 32)
        .u8(13, operatingMode)
        .u8(14, static_cast<int>(service))
        .u8(15, mcc[1] << 4 | mcc[0])
        .u8(16, filler << 4 | mcc[2])
        .u8(17, mnc[2] << 4 | mnc[1])
        .u8(18, area.lac >> 8) // the location area code is the one big-endian field
        .u8(19, area.lac)
        .u8(20, area.rac);
}

RecordBuilder equivalentNetworks(const std::vector<PLMN>& networks) {
    RecordBuilder record(0x7150, 17);
    record.u8(16, static_cast<int>(networks.size()));
    for (std::size_t i = 0; i < networks.size(); ++i) {
        const std::size_t entry = 17 + 3 * i;
        const auto mcc = digitsOf(networks[i].mcc);
        const auto mnc = digitsOf(networks[i].mnc);
        if (i == 0)
            record.u8(entry, mcc[0]).u8(entry + 1, mnc[0]).u8(entry + 2, mcc[1]);
        record.u8(entry + 3, mnc[1]).u8(entry + 4, mcc[2]).u8(entry + 5, mnc[2]);
    }
    return record;
}

} // namespace velmora::records
