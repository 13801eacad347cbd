// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/KnownRegions.h"

#include <algorithm>

namespace velmora {

namespace {

using enum KnownRegion::Kind;

/// In ascending order of code.
constexpr KnownRegion regions[] = {
    {0x108A, Fixed, 22, 1},
    {0x108A, WholeList, 23, 8, 14, u8At(22)},
    {0x1192, Fixed, 13, 4 + 4 * 56},
    {0x119C, SubPackets, 14, 1 << 1 | 1 << 2 | 1 << 3},
    {0x119D, SubPackets, 14, 1 << 11},
    {0x127E, Fixed, 14, 1750 - 14},
    {0x12B6, Fixed, 15, 1},
    {0x12B6, WholeList, 25, 4, 12, u8At(15)},
    {0x134F, Fixed, 13, 1},
    {0x134F, Fixed, 46, 4},
    {0x4005, Fixed, 13, 2},
    {0x4005, List, 15, 10, 10, u8At(13)},
    {0x4005, List, 15, 7, 7, u8At(14)},
    {0x4031, Fixed, 14, 1},
    {0x4031, List, 16, 14, 14, u8At(14)},
    {0x4116, Fixed, 13, 1},
    {0x4116, List, 16, 9, 9, u8At(13)},
    {0x417A, Fixed, 13, 3},
    {0x417A, List, 16, 15, 15, u8At(15)},
    {0x417A, List, 16, 44, 44, u8At(15), 0, u8At(15), 15},
    {0x4221, Fixed, 16, 2},
    {0x4221, List, 18, 9, 9, u8At(16)},
    {0x4221, List, 18, 9, 9, u8At(17), 0, u8At(16), 162},
    {0x5137, Fixed, 28, 1},
    {0x5137, List, 29, 14, 14, u8At(28)},
    {0x51F8, Fixed, 14, 1},
    {0x51F8, List, 15, 2, 2, u8At(14)},
    {0x51FF, Fixed, 14, 1},
    {0x51FF, List, 15, 4, 4, u8At(14)},
    {0x7135, Fixed, 15, 3},
    {0x7150, Fixed, 16, 1},
    {0x7150, List, 17, 6, 3, u8At(16)},
    {0xB179, Fixed, 27, 2},
    {0xB179, List, 29, 6, 6, u8At(27)},
    {0xB179, List, 29, 2, 2, u8At(28), 0, u8At(27), 6},
    {0xB180, Fixed, 19, 2},
    {0xB180, List, 21, 20, 20, bitsAt(19, 6, 5), 1},
    {0xB186, Fixed, 19, 1},
    {0xB186, List, 21, 12, 4, u8At(19)},
    {0xD00A, Fixed, 16, 1},
    {0xD00A, List, 168, 16, 16, bitsAt(16, 1, 7)},
    {0xD00C, Fixed, 14, 2},
    {0xD00C, List, 17, 2, 2, bitsAt(14, 6, 6)},
    {0xD00C, List, 289, 8, 8, bitsAt(15, 4, 4), 0, bitsAt(14, 6, 6), 34},
    {0xD00E, Fixed, 16, 1},
    {0xD00E, List, 17, 8, 8, u8At(16)},
    {0xD0E0, Fixed, 13, 1},
};
static_assert(std::ranges::is_sorted(regions, {}, &KnownRegion::code));

} // namespace

std::span<const KnownRegion> knownRegionsOf(std::uint32_t code) {
    // No std::ranges::equal_range: clang 14 refuses the range that libstdc++ returns.
    const auto* const begin = std::ranges::lower_bound(regions, code, {}, &KnownRegion::code);
    const auto* const end = std::ranges::upper_bound(regions, code, {}, &KnownRegion::code);
    return {begin, end};
}

} // namespace velmora
