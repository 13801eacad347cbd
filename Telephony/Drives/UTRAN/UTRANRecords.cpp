// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/UTRAN/UTRANRecords.h"

#include <algorithm>
#include <cmath>
#include <cstddef>

namespace velmora::records {
namespace {

template <class Entry>
std::size_t countUpTo(std::size_t limit, const std::vector<Entry>& entries) {
    return std::min(limit, entries.size());
}

int levelStep(int rscp_dBm) {
    return std::clamp(rscp_dBm + 116, 0, 91);
}

int errorStep(double rate) {
    if (rate <= 0)
        return 0;
    return std::clamp(63 + static_cast<int>(std::lround(std::log10(rate) / 0.065)), 1, 63);
}

int ratioStep(double sir_dB) {
    return std::clamp(static_cast<int>(std::lround(2 * (sir_dB + 11))), 0, 63);
}

/// Some cells are closed to the one or the other class of phones.
int accessRestrictions(const UTRANCell& cell) {
    return cell.cellId % 7 == 0 ? 1 : 0;
}

} // namespace

RecordBuilder utranRRCState(RRCState state) {
    return RecordBuilder(0xD0E0, 15).u8(13, 1).u8(14, static_cast<int>(state));
}

RecordBuilder utranServingCell(const UTRANCell& cell, bool emergencyCallsOnly) {
    return RecordBuilder(0xD0E2, 26)
        .u8(14, accessRestrictions(cell))
        .u8(15, cell.area.lac % 256) // the registration area
        .u16(17, cell.uarfcn)
        .u16(19, cell.uarfcn)
        .u32(21, cell.cellId)
        .u8(25, emergencyCallsOnly);
}

RecordBuilder utranNeighbours(const std::vector<UTRANNeighbour>& cells) {
    constexpr std::size_t first = 168;
    constexpr std::size_t stride = 16;
    const std::size_t count = countUpTo(32, cells);
    RecordBuilder record(0xD00A, first + stride * count);
    record.u8(16, static_cast<int>(count << 1));
    for (std::size_t i = 0; i < count; ++i) {
        const UTRANNeighbour& each = cells[i];
        // 14 bits, 7, 8, 2 and 1, the first in the lowest bits.
        const std::int64_t packed = std::int64_t{each.measurement.cell.uarfcn & 0x3FFF} |
                                    std::int64_t{each.measurement.cell.parameterId & 0x7F} << 14 |
                                    std::int64_t{levelStep(each.measurement.rscp_dBm)} << 21 |
                                    static_cast<std::int64_t>(each.set) << 29 |
                                    std::int64_t{each.jointDetection} << 31;
        record.u32(first + stride * i, packed);
    }
    return record;
}

RecordBuilder utranGSMNeighbours(const std::vector<GSMMeasurement>& cells) {
    constexpr int bsicValid = 0x8000;
    const std::size_t count = countUpTo(32, cells);
    RecordBuilder record(0xD00E, 17 + 8 * count);
    record.u8(16, static_cast<int>(count));
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t entry = 17 + 8 * i;
        const GSMCell& cell = *cells[i].cell;
        record
            .u16(entry, (cell.cellId & 0x3FFF) | bsicValid) // band indicator 0: 1800, not 1900
            .u8(entry + 2, cell.bsic / 8)
            .u8(entry + 3, cell.bsic % 8)
            .u16(entry + 4, cell.arfcn)
            .u16(entry + 6, cells[i].rssi_dBm);
    }
    return record;
}

RecordBuilder utranChannelQuality(const std::vector<UTRANTransportChannel>& transport,
                                  const std::vector<UTRANCompositeChannel>& composite) {
    const std::size_t transportCount = countUpTo(8, transport);
    const std::size_t compositeCount = countUpTo(8, composite);
    const std::size_t first = 289 + 34 * transportCount;
    RecordBuilder record(0xD00C, first + 8 * compositeCount);
    record.u16(14, static_cast<std::int64_t>(transportCount << 6 | compositeCount << 12));
    for (std::size_t i = 0; i < transportCount; ++i)
        record.u8(17 + 2 * i, transport[i].identity).u8(18 + 2 * i, errorStep(transport[i].blockErrorRate));
    for (std::size_t i = 0; i < compositeCount; ++i) {
        const std::size_t entry = first + 8 * i;
        const UTRANCompositeChannel& each = composite[i];
        record.u8(entry, each.identity).u8(entry + 1, each.slots);
        for (std::size_t slot = 0; slot < each.sir_dB.size(); ++slot)
            if (static_cast<int>(slot) < each.slots)
                record.u8(entry + 2 + slot, ratioStep(each.sir_dB[slot]));
    }
    return record;
}

} // namespace velmora::records
