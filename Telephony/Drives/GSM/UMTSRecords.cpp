// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/UMTSRecords.h"

#include <algorithm>
#include <cmath>

namespace velmora::records {
namespace {

template <class Entry>
std::size_t countUpTo(std::size_t limit, const std::vector<Entry>& entries) {
    return std::min(limit, entries.size());
}

void writeProcess(RecordBuilder& record, std::size_t entry, const HARQProcess& process) {
    record.u8(entry, process.identity)
        .u32(entry + 1, process.receivedBits)
        .u16(entry + 5, process.newTransmissions)
        .u16(entry + 7, process.blockErrors);
}

} // namespace

std::int64_t chipEnergy(double ecno_dB) {
    return std::llround(524288 * std::pow(10.0, ecno_dB / 10));
}

RecordBuilder rankedGSMCells(const std::vector<GSMMeasurement>& cells) {
    const std::size_t count = countUpTo(32, cells);
    RecordBuilder record(0x4005, 15 + 7 * count);
    record.u8(14, static_cast<int>(count));
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t entry = 15 + 7 * i;
        record.u16(entry, cells[i].cell->arfcn)
            .u16(entry + 2, cells[i].cell->bsic)
            .u8(entry + 4, cells[i].rssi_dBm)
            .u16(entry + 5, cells[i].rssi_dBm);
    }
    return record;
}

RecordBuilder rankedUMTSCells(const std::vector<UMTSMeasurement>& cells) {
    const std::size_t count = countUpTo(32, cells);
    RecordBuilder record(0x4005, 15 + 10 * count);
    record.u8(13, static_cast<int>(count));
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t entry = 15 + 10 * i;
        const UMTSMeasurement& each = cells[i];
        record.u16(entry, each.cell->uarfcn)
            .u16(entry + 2, each.cell->scramblingCode)
            .u8(entry + 4, each.rscp_dBm + 21)
            .u16(entry + 5, each.rscp_dBm)
            .u8(entry + 7, std::lround(each.ecno_dB * 2))
            .u16(entry + 8, each.rscp_dBm);
    }
    return record;
}

RecordBuilder transmitPowers(const std::vector<double>& powers_dBm) {
    const std::size_t count = countUpTo(32, powers_dBm);
    RecordBuilder record(0x4031, 16 + 14 * count);
    record.u8(14, static_cast<int>(count));
    for (std::size_t i = 0; i < count; ++i)
        record.u16(16 + 14 * i + 4, std::lround((powers_dBm[i] + 70) * 10) - 512);
    return record;
}

RecordBuilder blockErrorRates(int windowSize, const std::vector<TransportChannel>& channels) {
    const std::size_t count = countUpTo(32, channels);
    RecordBuilder record(0x4116, 16 + 9 * count);
    record.u8(13, static_cast<int>(count)).u16(14, windowSize);
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t entry = 16 + 9 * i;
        record.u8(entry, channels[i].identity)
            .u32(entry + 1, channels[i].crcs)
            .u32(entry + 5, channels[i].crcErrors);
    }
    return record;
}

RecordBuilder rrcState(RRCState state) {
    return RecordBuilder(0x4125, 14).u8(13, static_cast<int>(state));
}

RecordBuilder umtsServingCell(const UMTSCell& cell, int uraId) {
    return RecordBuilder(0x4127, 29)
        .u32(13, cell.uarfcn - 950)
        .u32(17, cell.uarfcn)
        .u32(21, cell.cellId)
        .u16(25, uraId);
}

RecordBuilder ciphering(bool enabled) {
    return RecordBuilder(0x4157, 19).u8(13, enabled);
}

RecordBuilder searchedCells(double received_dBm, const std::vector<SearchedCell>& cells) {
    const std::size_t count = countUpTo(16, cells);
    const std::size_t measurements = 16 + 15 * count;
    RecordBuilder record(0x417A, measurements + 44 * count);
    record.u16(13, std::lround((received_dBm + 106) * 10) - 512).u8(15, static_cast<int>(count));
    for (std::size_t i = 0; i < count; ++i) {
        const SearchedCell& each = cells[i];
        const int code = each.measurement.cell->scramblingCode;
        record.u8(16 + 15 * i + 7, code).u8(16 + 15 * i + 8, (code >> 8 & 0x1F) | each.setType << 5);
        // The three energies are the receiver's fingers; the first one that is locked counts.
        const std::int64_t energy = chipEnergy(each.measurement.ecno_dB);
        record.u32(measurements + 44 * i + 32, energy)
            .u32(measurements + 44 * i + 36, energy / 2)
            .u32(measurements + 44 * i + 40, energy / 4);
    }
    return record;
}

RecordBuilder harqStatistics(int subFrames, const std::vector<HARQProcess>& primary,
                             const std::vector<HARQProcess>& secondary) {
    constexpr int singleCarrier = 0;
    constexpr int dualCarrier = 2;
    const std::size_t primaries = countUpTo(8, primary);
    const std::size_t secondaries = countUpTo(8, secondary);
    RecordBuilder record(0x4221, 18 + 9 * primaries);
    record.u8(13, 1)
        .u8(14, subFrames)
        .u8(15, (subFrames >> 8 & 3) | (secondaries > 0 ? dualCarrier : singleCarrier) << 2)
        .u8(16, static_cast<int>(primaries))
        .u8(17, static_cast<int>(secondaries));
    for (std::size_t i = 0; i < primaries; ++i)
        writeProcess(record, 18 + 9 * i, primary[i]);
    // Each primary process takes a block of 162 bytes before the secondary ones begin.
    for (std::size_t i = 0; i < secondaries; ++i)
        writeProcess(record, 18 + 162 * primaries + 9 * i, secondary[i]);
    return record;
}

} // namespace velmora::records
