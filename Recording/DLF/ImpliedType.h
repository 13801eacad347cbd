// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/LiveModem.h"
#include "LogMessages/LogMessage.h"

#include <cstdint>

namespace velmora {

/// The type of a record that a DLF log keeps without its type byte: that of the extra stream for the codes 0
/// to 7, which the baseband's stream does not have, else the baseband's.
[[nodiscard]] constexpr std::uint8_t impliedType(std::uint16_t code) {
    return LogMessage::firstExtraCode + code <= LiveModemCode::position ? LogMessage::extraType
                                                                        : LogMessage::basebandType;
}

} // namespace velmora
