// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/GSMCellRecords.h"

#include <algorithm>

namespace velmora::records {
namespace {

template <class Entry>
std::size_t countUpTo(std::size_t limit, const std::vector<Entry>& entries) {
    return std::min(limit, entries.size());
}

int pathLossCriterion(int rssi_dBm) {
    return rssi_dBm - gsmAccessMinimum_dBm;
}

} // namespace

RecordBuilder gsmServingCell(const GSMCell& cell) {
    return RecordBuilder(0x5134, 26).u16(13, cell.arfcn).u16(15, cell.bsic).u16(17, cell.cellId);
}

RecordBuilder gsmMeasurements(const GSMMeasurement& serving, int c2, bool hysteresisApplied,
                              const std::vector<GSMMeasurement>& neighbours) {
    const std::size_t count = countUpTo(32, neighbours);
    RecordBuilder record(0x5137, 29 + 14 * count);
    record.u8(15, -serving.rssi_dBm)
        .u32(16, pathLossCriterion(serving.rssi_dBm))
        .u32(20, c2)
        .u8(26, hysteresisApplied)
        .u8(28, static_cast<int>(count));
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t entry = 29 + 14 * i;
        record.u16(entry, neighbours[i].cell->arfcn)
            .u8(entry + 2, -neighbours[i].rssi_dBm)
            .u32(entry + 3, pathLossCriterion(neighbours[i].rssi_dBm));
    }
    return record;
}

RecordBuilder dedicatedChannel(int arfcn) {
    return RecordBuilder(0x5076, 17).u16(13, arfcn);
}

RecordBuilder bsicList(const std::vector<GSMMeasurement>& cells) {
    const std::size_t count = countUpTo(32, cells);
    RecordBuilder record(0x51FF, 15 + 4 * count);
    record.u8(14, static_cast<int>(count));
    for (std::size_t i = 0; i < count; ++i)
        record.u16(15 + 4 * i, cells[i].cell->arfcn).u8(17 + 4 * i, cells[i].cell->bsic);
    return record;
}

RecordBuilder si13Position(int position) {
    return RecordBuilder(0x51F4, 15).u8(14, position);
}

RecordBuilder gprsCellOptions(int pfcSupport, int priorityAccessThreshold, int networkControlOrder) {
    return RecordBuilder(0x51F5, 18)
        .u8(13, pfcSupport)
        .u8(14, priorityAccessThreshold)
        .u8(15, networkControlOrder);
}

RecordBuilder gprsTimers(int t3192, int drxTimerMaximum, bool elevenBitBurst) {
    return RecordBuilder(0x51F6, 24).u8(15, t3192).u8(16, drxTimerMaximum).u8(17, elevenBitBurst);
}

RecordBuilder pbcchPresence(bool present) {
    return RecordBuilder(0x51FB, 34).u8(13, present);
}

RecordBuilder packetSystemInformation(int psiStatus, int countLR, int countHR, int extendedOrder,
                                      bool siStatusSupported) {
    return RecordBuilder(0x51FD, 35)
        .u8(13, psiStatus)
        .u8(14, countLR)
        .u8(15, countHR)
        .u8(16, extendedOrder)
        .u8(33, siStatusSupported);
}

RecordBuilder rrState(RRState state, int subState, int status, bool data) {
    return RecordBuilder(0x512C, 17)
        .u8(13, static_cast<int>(state))
        .u8(14, subState)
        .u8(15, status)
        .u8(16, data);
}

RecordBuilder discontinuousTransmission(bool used) {
    return RecordBuilder(0x5072, 20).u8(19, used);
}

RecordBuilder mobileAllocation(int hoppingSequence, const std::vector<int>& arfcns) {
    const std::size_t count = countUpTo(64, arfcns);
    RecordBuilder record(0x51F8, 15 + 2 * count);
    record.u8(13, hoppingSequence).u8(14, static_cast<int>(count));
    for (std::size_t i = 0; i < count; ++i)
        record.u16(15 + 2 * i, arfcns[i]);
    return record;
}

} // namespace velmora::records
