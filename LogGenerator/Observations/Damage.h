// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string_view>

namespace velmora {

/// What the decoder found malformed in a message.
enum class Damage : std::uint8_t {
    None,
    NoRecord,       ///< shorter than what it must have, or than its own header
    WrongType,      ///< neither a record of the baseband nor one of the extra stream
    TooShort,       ///< below the least length of its log code
    MissingEntries, ///< its count exceeds the entries that it holds
    Unreadable,     ///< its property list, or what that must hold
};

/// "no record", "wrong type", "too short", "missing entries", "unreadable"; empty for `None`.
[[nodiscard]] std::string_view nameOf(Damage damage);

} // namespace velmora
