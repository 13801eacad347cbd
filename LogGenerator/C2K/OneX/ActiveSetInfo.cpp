// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/OneX/ActiveSetInfo.h"

#include "LogGenerator/C2K/PilotFields.h"

#include <cmath>

namespace velmora::C2K {

namespace {

/// A pilot's PN offset (units of 64 chips, 3GPP2 C.S0002) lies so far past the cursor; the cursor begins at
/// the sub-packet's own start, not after its header. Energies are on the modem's own scale, see energyRatio.
constexpr std::size_t pnOffsetAt = 12;
constexpr std::size_t firstEnergyAt = 24;

constexpr Content listContents[] = {pilotEnergy, referencePilotEnergy};

constexpr double leastRatio = 0.00001; // -50 dB

} // namespace

const List ActiveSetInfo::pilotList{"k1xActiveSetInfo", List::Entries::Numbered, "", listContents};

ActiveSetInfo::ActiveSetInfo(const Record& subPacket)
    : _subPacket(subPacket), _n(subPacket.u16(4)), _g(subPacket.u8(6)), _s(subPacket.u8(7)),
      _count(subPacket.u8(8)), _energyAt(firstEnergyAt + std::size_t{4} * subPacket.u8(9)),
      _stride((std::size_t{6} * subPacket.u8(9) + 15) & 0xFFC), _referencePN(subPacket.u16(10)) {}

std::size_t ActiveSetInfo::neededLength() const {
    return _count == 0 ? headerLength : _stride * (_count - 1) + _energyAt + 2;
}

void ActiveSetInfo::visitPilots(FieldVisitor& visitor) const {
    visitor.beginList(pilotList);
    for (std::size_t i = 0; i < _count; ++i) {
        const std::size_t cursor = _stride * i;
        const std::uint16_t pnOffset = _subPacket.u16(cursor + pnOffsetAt);
        visitor.entryNumber(i, pnOffset);
        visitor.real(pnOffset == _referencePN ? referencePilotEnergy : pilotEnergy,
                     decibels(energyRatio(_subPacket.u16(cursor + _energyAt))));
    }
    visitor.endList();
}

double ActiveSetInfo::energyRatio(std::uint16_t energy) const {
    const double n = _n;
    const double ratio = std::ldexp(energy, 2 * _s - 3) / (9 * n * n * _g) - 1 / n;
    // fmax, since a ratio that is no number (N or G of 0) shows the floor, too.
    return std::fmax(ratio, leastRatio);
}

} // namespace velmora::C2K
