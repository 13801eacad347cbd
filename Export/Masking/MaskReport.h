// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <iterator>
#include <map>
#include <string_view>

namespace velmora {

/// What masking does something to.
enum class Masked : std::uint8_t {
    Subscriber,
    Equipment,
    Address,
    Location,
    Position,
    Times,
    NumberInText,    ///< what looks like a number of a subscriber in a text that should have none
    UnknownCode,     ///< a message of a log code that no decoder of the technology subscribes to
    UnknownKey,      ///< an entry of a property list, SIM files included
    UnknownBytes,    ///< of a known record: those that no field is read from
    Malformed,       ///< a message without a valid header, or whose property list cannot be read
    OtherTechnology, ///< a message of a technology that is not known
    Comment,         ///< a text for people, of a file
};

inline constexpr std::string_view maskedNames[] = {
    "subscriber",   "equipment",   "address",       "location",  "position",         "time",    "text number",
    "unknown code", "unknown key", "unknown bytes", "malformed", "other technology", "comment",
};
inline constexpr std::size_t maskedCount = std::size(maskedNames);

/// What was done, by class and count, never with a value.
struct MaskReport {
    std::array<std::uint64_t, maskedCount> counts{};
    std::uint64_t messages = 0; ///< in all
    std::uint64_t changed = 0;  ///< of them
    std::uint64_t leftOut = 0;  ///< of them
    /// The messages of unknown codes, by code; of the first codes only, since damage may make up any.
    std::map<std::uint32_t, std::uint64_t> unknownCodes;
    static constexpr std::size_t mostCodes = 100;

    void add(Masked what, std::uint64_t count = 1) { counts[static_cast<std::size_t>(what)] += count; }
    [[nodiscard]] std::uint64_t of(Masked what) const { return counts[static_cast<std::size_t>(what)]; }
};

} // namespace velmora
