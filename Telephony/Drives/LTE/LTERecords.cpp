// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/LTE/LTERecords.h"

#include <algorithm>
#include <cmath>

namespace velmora::records {
namespace {

/// Steps of `step` above `lowest`, never more than `width` bits hold.
std::int64_t steps(double value, double lowest, double step, unsigned width) {
    return std::clamp<std::int64_t>(std::llround((value - lowest) / step), 0, (std::int64_t{1} << width) - 1);
}

} // namespace

RecordBuilder lteAntennas(const LTECell& cell, int transmitAntennas) {
    return RecordBuilder(0xB0C1, 22)
        .u8(13, 2)
        .u16(14, cell.physicalId)
        .u16(16, lteCarriers[cell.carrier].downlink)
        .u8(20, transmitAntennas)
        .u8(21, lteCarriers[cell.carrier].resourceBlocks);
}

RecordBuilder lteServingCell(const LTECell& cell) {
    const LTECarrier& carrier = lteCarriers[cell.carrier];
    return RecordBuilder(0xB0C2, 38)
        .u8(13, 2)
        .u16(14, cell.physicalId)
        .u16(16, carrier.downlink)
        .u16(18, carrier.uplink)
        .u8(20, carrier.resourceBlocks)
        .u8(21, carrier.resourceBlocks)
        .u32(22, cell.identity)
        .u16(26, cell.area.lac)
        .u32(28, carrier.band)
        .u16(32, cell.area.plmn.mcc)
        .u8(34, 2) // digits of the MNC
        .u16(35, cell.area.plmn.mnc);
}

RecordBuilder lteIntraFrequency(const LTEMeasurement& serving, int subframe,
                                const std::vector<LTEMeasurement>& neighbours,
                                const std::vector<LTEMeasurement>& detected) {
    const std::size_t n = std::min<std::size_t>(neighbours.size(), 255);
    const std::size_t m = std::min<std::size_t>(detected.size(), 255);
    RecordBuilder record(0xB179, 29 + 6 * n + 2 * m);
    const auto level = [](const LTEMeasurement& cell) { return steps(cell.rsrp_dBm, -140, 0.25, 16); };
    const auto quality = [](const LTEMeasurement& cell) { return steps(cell.rsrq_dB, -20, 0.125, 16); };
    record.u8(13, 3)
        .u16(17, lteCarriers[serving.cell.carrier].downlink)
        .u16(19, serving.cell.physicalId)
        .u16(21, subframe)
        .u16(23, level(serving))
        .u16(25, quality(serving))
        .u8(27, static_cast<int>(n))
        .u8(28, static_cast<int>(m));
    for (std::size_t i = 0; i < n; ++i)
        record.u16(29 + 6 * i, neighbours[i].cell.physicalId)
            .u16(31 + 6 * i, level(neighbours[i]))
            .u16(33 + 6 * i, quality(neighbours[i]));
    for (std::size_t i = 0; i < m; ++i)
        record.u16(29 + 6 * n + 2 * i, detected[i].cell.physicalId);
    return record;
}

int selectionLevel_dB(const LTEMeasurement& cell) {
    return static_cast<int>(std::lround(cell.rsrp_dBm)) - lteAccessMinimum_dBm;
}

RecordBuilder lteIdleMeasurement(const LTEIdleMeasurement& measurement) {
    constexpr int absent = 32; // for thresholds
    const auto power = steps(measurement.limitedPower ? lteMaximumPower_dBm : 34, -30, 1, 7); // 64: absent
    const LTECell& cell = measurement.now.cell;
    RecordBuilder record(0xB17F, 33);
    record.u8(13, 1)
        .u16(17, lteCarriers[cell.carrier].downlink)
        .bits(19, 0, 9, cell.physicalId)
        .bits(20, 1, 4, lteCarriers[cell.carrier].priority)
        .bits(21, 0, 9, steps(measurement.now.rsrp_dBm, -140, 0.25, 9))
        .bits(22, 1, 9, steps(measurement.average.rsrp_dBm, -140, 0.25, 9))
        .bits(23, 2, 7, steps(measurement.now.rsrq_dB, -30, 0.25, 7))
        .bits(24, 1, 7, steps(measurement.average.rsrq_dB, -30, 0.25, 7))
        .bits(25, 0, 9, steps(measurement.now.rssi_dBm, -140, 0.5, 9))
        .bits(26, 1, 6, steps(lteAccessMinimum_dBm, -140, 2, 6))
        .bits(26, 7, 7, power)
        .bits(27, 6, 6, steps(lteMaximumPower_dBm, -30, 1, 6))
        .bits(29, 0, 7, steps(selectionLevel_dB(measurement.now), -30, 1, 7))
        .bits(29, 7, 6, measurement.cyclesBelow)
        .bits(30, 5, 6, lteIntraSearch_dB / 2)
        .bits(31, 3, 6, measurement.searchesAlways ? absent : lteNonIntraSearch_dB / 2)
        .bits(32, 1, 1, measurement.rulesUpdated)
        .bits(32, 2, 4, measurement.rules);
    return record;
}

RecordBuilder lteNeighbours(const LTECarrier& carrier, const std::vector<LTENeighbour>& cells) {
    const std::size_t count = std::clamp<std::size_t>(cells.size(), 1, 32);
    RecordBuilder record(0xB180, 21 + 20 * count);
    record.u8(13, 1)
        .u16(17, carrier.downlink)
        .bits(19, 0, 6, steps(lteAccessMinimum_dBm, -140, 2, 6))
        .bits(19, 6, 5, static_cast<int>(count) - 1);
    for (std::size_t i = 0; i < std::min(count, cells.size()); ++i) {
        const LTENeighbour& cell = cells[i];
        const std::size_t entry = 21 + 20 * i;
        record.bits(entry, 0, 9, cell.now.cell.physicalId)
            .bits(entry + 1, 1, 8, steps(cell.now.rssi_dBm, -140, 0.5, 8))
            .bits(entry + 2, 1, 9, steps(cell.now.rsrp_dBm, -140, 0.5, 9))
            .bits(entry + 4, 0, 9, steps(cell.average.rsrp_dBm, -140, 0.5, 9))
            .bits(entry + 5, 1, 7, steps(cell.now.rsrq_dB, -30, 0.25, 7))
            .bits(entry + 6, 0, 7, steps(cell.average.rsrq_dB, -30, 0.25, 7))
            .bits(entry + 6, 7, 7, steps(selectionLevel_dB(cell.now), -30, 1, 7))
            .u16(entry + 8, cell.frequencyOffset)
            .bits(entry + 12, 0, 11, cell.frameOffset)
            .bits(entry + 13, 3, 19, cell.sampleOffset);
    }
    return record;
}

RecordBuilder reselectionCandidates(const LTECell& serving,
                                    const std::vector<ReselectionCandidate>& candidates) {
    const std::size_t count = std::min<std::size_t>(candidates.size(), 255);
    const auto isCDMA = [](RATType type) { return type == RATType::CDMA1xRTT || type == RATType::CDMAHRPD; };
    std::size_t length = 21;
    for (std::size_t i = 0; i < count; ++i) {
        const RATType type = candidates[i].type;
        const std::size_t own = isCDMA(type) ? 12 : type == RATType::Other ? 4 : 8;
        length = std::max(length, 21 + 4 * i + own);
    }
    RecordBuilder record(0xB186, length);
    record.u8(13, 1)
        .u16(15, lteCarriers[serving.carrier].downlink)
        .u16(17, serving.physicalId)
        .u16(19, static_cast<int>(count));
    for (std::size_t i = 0; i < count; ++i)
        record.u16(21 + 4 * i, candidates[i].priority).u16(23 + 4 * i, static_cast<int>(candidates[i].type));
    if (count == 0)
        return record;
    const ReselectionCandidate& last = candidates[count - 1];
    const std::size_t behind = 21 + 4 * count;
    switch (last.type) {
    case RATType::LTE: record.u16(behind, last.channel).u16(behind + 2, last.cell << 7); break;
    case RATType::UTRAN: record.u16(behind, last.channel).u16(behind + 2, last.cell); break;
    case RATType::GERAN:
        record.u16(behind, last.channel).u8(behind + 2, last.band).u8(behind + 3, last.cell);
        break;
    case RATType::CDMA1xRTT:
    case RATType::CDMAHRPD:
        record.u8(behind, last.band).u16(behind + 4, last.channel).u16(behind + 6, last.cell);
        break;
    case RATType::Other: break;
    }
    return record;
}

} // namespace velmora::records
