// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Recording/DLF/RecordChain.h"

#include <cstddef>
#include <cstdint>
#include <random>
#include <span>
#include <vector>

/// Measures how well a RecordChain finds records in damaged bytes: writes messages as a chain, spoils some
/// bytes, reads the chain and compares its records with those written.

namespace velmora {

enum class ChainForm : std::uint8_t {
    RawMessages,    ///< messages as they arrived
    ApplicationLog, ///< a DLF log as the application writes it: the first byte of each buffer is missing
    CompactLog,     ///< a DLF log as DLFWriter writes it: most records lack their type byte
};
inline constexpr ChainForm everyChainForm[] = {ChainForm::RawMessages, ChainForm::ApplicationLog,
                                               ChainForm::CompactLog};

enum class ChainDamage : std::uint8_t {
    None,
    Bit,         ///< one bit flipped
    Overwritten, ///< 1 to 64 bytes of noise instead of the record's
    Zeroed,      ///< 1 to 64 bytes of zeros
    Deleted,     ///< 1 to 64 bytes gone
    Inserted,    ///< 1 to 64 bytes of noise between
};
inline constexpr ChainDamage everyChainDamage[] = {ChainDamage::None,        ChainDamage::Bit,
                                                   ChainDamage::Overwritten, ChainDamage::Zeroed,
                                                   ChainDamage::Deleted,     ChainDamage::Inserted};

/// What came of some damages.
struct ChainErrors {
    std::size_t damages = 0;
    std::size_t untouched = 0; ///< records that no damage touched
    std::size_t lost = 0;      ///< of these, the ones that were not returned as they were written
    std::size_t invented = 0;  ///< records returned where none was written

    ChainErrors& operator+=(const ChainErrors& other);
    [[nodiscard]] std::size_t errors() const { return lost + invented; }
};

/// Takes `count` runs of 40 messages at random, damages each once and reads it with these weights. Messages
/// that cannot be followed in a chain, because their length field is not their length, are left out.
[[nodiscard]] ChainErrors measureChain(std::span<const Data> messages, ChainForm form, ChainDamage damage,
                                       std::size_t count, const RecordWeights& weights,
                                       std::mt19937_64& random);

/// Reads noise and counts the records that are found in it.
[[nodiscard]] ChainErrors measureNoise(std::size_t bytes, RecordChain::Layout layout,
                                       const RecordWeights& weights, std::mt19937_64& random);

} // namespace velmora
