// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string_view>

namespace velmora {

/// The binary log technologies as sets, one bit each.
inline constexpr unsigned technologyBits = 4;

/// The technologies whose decoders want a log code (see LogMessage::logCode), as a set. This room may not
/// include the decoders; a test compares the table with them.
[[nodiscard]] std::uint8_t technologiesOfCode(std::uint32_t logCode);

/// The short name of the technology of a bit, which is counted from 0.
[[nodiscard]] std::string_view technologyOfBit(unsigned bit);

} // namespace velmora
