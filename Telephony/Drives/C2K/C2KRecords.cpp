// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/C2K/C2KRecords.h"

#include <algorithm>
#include <cmath>

namespace velmora::records {
namespace {

constexpr std::size_t mostPilots = 6;
constexpr int noPilot = 0xFFFF;

/// A ratio as a count of units, within 16 bits; never 0, which would be no energy at all.
std::int64_t units(double ratio_dB, double perOne) {
    return std::clamp<std::int64_t>(std::llround(std::pow(10.0, ratio_dB / 10) * perOne), 1, 0xFFFF);
}

std::int64_t wholeLevel(double level_dBm) {
    return std::clamp<std::int64_t>(std::llround(level_dBm), -128, 127);
}

/// The 1x receiver's scale: 0.334 dB a step, 0 at -63.248 dBm.
std::int64_t oneXLevel(double level_dBm) {
    return std::clamp<std::int64_t>(std::llround((level_dBm + 63.248) / 0.334), -128, 127);
}

/// Begins a sub-packet; its place.
std::size_t subPacket(RecordBuilder& record, int id, std::size_t size) {
    const std::size_t start = record.size();
    record.u8(start, id).u16(start + 2, static_cast<std::int64_t>(size)).u8(start + size - 1, 0);
    return start;
}

// How the 1x active set normalises its energies, and the fingers that it has room for in a pilot.
constexpr int correlation = 512;
constexpr int gain = 1;
constexpr int shift = 5;
constexpr int fingersPerPilot = 1;
constexpr std::size_t pilotSize = 20;

/// The energy that stands for this ratio: (ratio + 1/N) 9 N^2 G / 2^(2S-3).
std::int64_t energy(double ecio_dB) {
    const double perOne = 9.0 * correlation * correlation * gain / (1 << (2 * shift - 3));
    return std::llround((std::pow(10.0, ecio_dB / 10) + 1.0 / correlation) * perOne);
}

void addActiveSet(RecordBuilder& record, const std::vector<C2KPilot>& pilots) {
    const std::size_t count = std::min(pilots.size(), mostPilots);
    const std::size_t start = subPacket(record, 3, 12 + pilotSize * count);
    record.u16(start + 4, correlation).u8(start + 6, gain).u8(start + 7, shift);
    record.u8(start + 8, static_cast<std::int64_t>(count)).u8(start + 9, fingersPerPilot);
    record.u16(start + 10, count > 0 ? pilots.front().sector.pnOffset : noPilot);
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t pilot = start + 12 + pilotSize * i;
        record.u16(pilot, pilots[i].sector.pnOffset).u16(pilot + 16, energy(pilots[i].ecio_dB));
    }
}

} // namespace

RecordBuilder evdoStatus(const EVDOStatusReport& report) {
    RecordBuilder record(0x1183, 50);
    const C2KSector sector = report.serving.value_or(C2KSector{});
    record.u16(13, sector.packetChannel | sector.bandClass << 11);
    record.u8(15, wholeLevel(report.received_dBm[0])).u8(16, wholeLevel(report.received_dBm[1]));
    record.u8(17, wholeLevel(report.sent_dBm));
    record.u16(18, report.serving ? sector.pnOffset : noPilot);
    record.u8(36, static_cast<int>(report.state)).u8(37, static_cast<int>(report.session));
    record.u16(38, report.uati & 0xFFFF).u8(40, report.uati >> 16);
    return record.u8(41, sector.colorCode);
}

RecordBuilder evdoActiveSet(const std::vector<C2KPilot>& pilots) {
    const std::size_t count = std::min(pilots.size(), mostPilots);
    RecordBuilder record(0x12B6, 25 + 12 * count);
    record.u8(15, static_cast<std::int64_t>(count));
    for (std::size_t i = 0; i < count; ++i) {
        // In a pilot burst the pilot has the sector's entire power: C/I to C/(C + I).
        const double ci = std::pow(10.0, pilots[i].ci_dB / 10);
        record.u16(25 + 12 * i, pilots[i].sector.pnOffset);
        record.u16(27 + 12 * i, units(10 * std::log10(ci / (1 + ci)), 512));
    }
    return record;
}

RecordBuilder evdoFingers(const std::vector<C2KPilot>& pilots, std::size_t fingers) {
    RecordBuilder record(0x108A, 23 + 14 * fingers);
    record.u8(22, static_cast<std::int64_t>(fingers));
    for (std::size_t i = 0; i < fingers; ++i) {
        record.u16(23 + 14 * i, i < pilots.size() ? pilots[i].sector.pnOffset : noPilot);
        if (i < pilots.size())
            record.u16(29 + 14 * i, units(pilots[i].ci_dB, 512));
    }
    return record;
}

RecordBuilder oneXStatus(const OneXStatusReport& report) {
    RecordBuilder record(0x119C, 17);
    record.u8(14, 4);
    const std::size_t system = subPacket(record, 1, 8);
    record.u8(system + 4, static_cast<int>(report.state));
    const std::size_t radio = subPacket(record, 2, 14);
    record.u8(radio + 4, report.serving.bandClass).u8(radio + 5, report.serving.bandClass);
    record.u16(radio + 6, report.serving.channel).u16(radio + 8, report.serving.channel);
    record.u8(radio + 10, oneXLevel(report.received_dBm[0]));
    record.u8(radio + 11, oneXLevel(report.received_dBm[1]));
    record.u16(radio + 12, std::llround(report.sent_dBm * 10));
    addActiveSet(record, report.pilots);
    subPacket(record, 4, 8); // the fingers, which no decoder reads
    return record;
}

RecordBuilder trafficFrame(bool erased) {
    RecordBuilder record(0x119D, 17);
    record.u8(14, 1);
    const std::size_t demodulation = subPacket(record, 11, 28);
    return record.u8(demodulation + 24, erased ? 1 : 0);
}

RecordBuilder systemIdentification(const std::optional<C2KSector>& serving, int roamingIndicator) {
    RecordBuilder record(0x134F, 190);
    record.u8(13, 2);
    if (!serving)
        return record;
    record.u32(42, roamingIndicator).u32(46, 2).u16(50, serving->sid).u16(52, serving->nid);
    record.u8(131, serving->packetZone).u8(133, 6);
    return record.u16(184, serving->baseId);
}

RecordBuilder forwardPackets(std::int64_t second, const ForwardPackets& packets) {
    RecordBuilder record(0x1192, 241);
    record.u32(13, second);
    // Each packet is counted among those of its size; there are several such counters, by rate.
    return record.u32(17 + 4 * 3, packets.of1024)
        .u32(17 + 4 * 27, packets.of2048)
        .u32(17 + 4 * 45, packets.of4096);
}

RecordBuilder reversePackets(std::int64_t second, const ReversePackets& packets) {
    RecordBuilder record(0x127E, 1750);
    record.u32(14, second);
    // By size index, each in the first block: 256, 1024 and 4096 bits; some got there with their second try.
    const auto put = [&record](std::size_t index, std::int64_t count) {
        record.u32(18 + 24 * index, count - count / 5).u32(22 + 24 * index, count / 5);
    };
    put(1, packets.of256);
    put(4, packets.of1024);
    put(8, packets.of4096);
    return record;
}

} // namespace velmora::records
