// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"
#include "Telephony/Drives/RecordBuilder.h"

#include <array>
#include <cstddef>
#include <cstdint>

namespace velmora {

/// The codes of all messages of a live modem, in the order in which they are sent.
[[nodiscard]] const std::array<std::uint32_t, 8>& liveModemCodes();

/// What fits the length field of a record beside its header.
inline constexpr std::size_t maximumPayload = 0xFFFF + 1 - 13;

/// The record of a code of LiveModemCode with that root. Of a list of cells that is too long the last ones
/// are left out, and their number is in the message; anything else that is too long is reduced to the state.
[[nodiscard]] RecordBuilder liveModemRecord(std::uint32_t code, const Dictionary& root);

} // namespace velmora
