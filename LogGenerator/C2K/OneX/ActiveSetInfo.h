// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/FieldVisitor.h"
#include "LogMessages/Record.h"

#include <cstddef>

namespace velmora::C2K {

/// The active-set sub-packet of the 1x status: the pilots with their energies in dB, relative to the total.
class ActiveSetInfo {
public:
    /// What precedes the pilots.
    static constexpr std::size_t headerLength = 12;

    /// The pilots.
    static const List pilotList;

    /// `subPacket`: the record from the sub-packet's start on. Precondition: it has the header.
    explicit ActiveSetInfo(const Record& subPacket);

    /// The length that its pilots need; precondition of `visitPilots`: the record has it.
    [[nodiscard]] std::size_t neededLength() const;

    /// Names the pilot list. Without pilots it is an empty list; there is no "(none)".
    void visitPilots(FieldVisitor& visitor) const;

private:
    [[nodiscard]] double energyRatio(std::uint16_t energy) const;

    Record _subPacket;
    int _n; ///< what energies are normalised by, with _g and _s
    int _g;
    int _s;
    std::size_t _count;
    std::size_t _energyAt; ///< in a pilot
    std::size_t _stride;   ///< from pilot to pilot
    std::uint16_t _referencePN;
};

} // namespace velmora::C2K
