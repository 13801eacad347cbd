// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"

#include <cstdint>

/// 0xD00C, the transport channels' quality, as "TRCH BLER" and "CCTRCH SIR" read it. Both counts lie in the
/// 16 bits at 14: the transport channels' in bits 6 to 11, the coded composite ones' in the four above.
namespace velmora::UTRAN::quality {

inline constexpr std::uint32_t code = 0xD00C;
inline constexpr std::size_t minimumLength = 17;

inline constexpr Place transportChannels = bitsAt(14, 6, 6);
inline constexpr Place compositeChannels = bitsAt(15, 4, 4);
static_assert(transportChannels.end() <= minimumLength && compositeChannels.end() <= minimumLength);

/// The entries of the transport channels follow the minimum.
inline constexpr std::size_t transportChannelLength = 2;

/// The offset of the first composite channel's entry. The 34 bytes that each transport channel moves them by
/// are not the length of its entry, on purpose.
constexpr std::size_t firstCompositeChannel(std::size_t transportChannelCount) {
    return 289 + 34 * transportChannelCount;
}
inline constexpr std::size_t compositeChannelLength = 8;

} // namespace velmora::UTRAN::quality
