// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Telephony/Drives/RecordBuilder.h"

#include <array>
#include <cstdint>
#include <optional>

namespace velmora {

/// What is unusual about a message now and then. Decoders have to cope with all of it.
enum class UnusualMessage : std::uint8_t {
    Truncated,    ///< five bytes of a record: too short to be decoded
    WrongType,    ///< a type byte of 2
    BelowMinimum, ///< a well-framed record that is shorter than its section's least length
    Prefixed,     ///< a prefix before a good record: unusual, but no error
    CountOverrun, ///< a count that exceeds the record's entries
    UnknownCode,  ///< a good record of a code that no decoder wants
};
inline constexpr std::array allUnusualMessages = {UnusualMessage::Truncated,    UnusualMessage::WrongType,
                                                  UnusualMessage::BelowMinimum, UnusualMessage::Prefixed,
                                                  UnusualMessage::CountOverrun, UnusualMessage::UnknownCode};

/// A technology's parts of unusual messages.
struct UnusualMessageParts {
    RecordBuilder good;                   ///< for unusual framing
    RecordBuilder belowMinimum;           ///< already shorter than its section's least length
    std::optional<RecordBuilder> overrun; ///< already with fewer entries than its count
    std::int64_t noise = 0;               ///< what the record of the unknown code holds, 32 bits
};

/// A message of that kind; none where the technology has no parts for it. Records of the extra stream are
/// never changed: an unreadable SIM file ends the application.
[[nodiscard]] std::optional<Data> unusualMessage(UnusualMessage damage, const UnusualMessageParts& material,
                                                 Time moment);

} // namespace velmora
