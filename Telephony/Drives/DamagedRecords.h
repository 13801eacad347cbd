// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Telephony/Drives/RecordBuilder.h"

#include <array>
#include <cstdint>
#include <optional>

namespace velmora {

/// What is odd about a message now and then. Decoders have to cope with all of it.
enum class Damage : std::uint8_t {
    CutShort,     ///< five bytes of a record: too short to be looked at
    WrongType,    ///< a type byte of 2
    BelowMinimum, ///< a well-framed record that is shorter than its section's least length
    Prefixed,     ///< a prefix before a good record: odd, but nothing is wrong with it
    CountOverrun, ///< a count byte that promises more entries than the record holds
    UnknownCode,  ///< a good record of a code that no decoder wants
};
inline constexpr std::array everyDamage = {Damage::CutShort, Damage::WrongType,    Damage::BelowMinimum,
                                           Damage::Prefixed, Damage::CountOverrun, Damage::UnknownCode};

/// What a technology gives to be spoilt.
struct DamageMaterial {
    RecordBuilder good;                   ///< for what is odd about the framing
    RecordBuilder belowMinimum;           ///< already shorter than its section's least length
    std::optional<RecordBuilder> overrun; ///< already with fewer entries than its count promises
    std::int64_t noise = 0;               ///< what the record of the unknown code holds, 32 bits
};

/// A message of that kind; none where there is nothing to spoil. Records of the extra stream are never
/// touched: an unreadable SIM file ends the application.
[[nodiscard]] std::optional<Data> damagedMessage(Damage damage, const DamageMaterial& material, Time moment);

} // namespace velmora
