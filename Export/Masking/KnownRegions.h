// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Place.h"

#include <cstddef>
#include <cstdint>
#include <span>

namespace velmora {

/// What decoders read of a record beside the fields that the catalogue has a place for: counts, the entries
/// of lists, versions. Whatever is in no region and no field is not known, and does not leave with a masked
/// record.
struct KnownRegion {
    enum class Kind : std::uint8_t {
        Fixed,      ///< `first` to `first + length`
        List,       ///< entries of `length` bytes, `stride` apart, from `first` on
        WholeList,  ///< a list of which nothing is read where the record ends within it
        SubPackets, ///< of CDMA2000: those of the ids in the bits of `length`, and the headers of the others
    };

    std::uint32_t code;
    Kind kind;
    std::size_t first;
    std::size_t length;
    std::size_t stride = 0;
    Place count = computed;
    std::size_t countOffset = 0; ///< added to the count
    Place moved = computed;      ///< a number by which the list's first entry is moved, `movedBy` for each
    std::size_t movedBy = 0;
};

/// The regions of a log code.
[[nodiscard]] std::span<const KnownRegion> knownRegionsOf(std::uint32_t code);

} // namespace velmora
