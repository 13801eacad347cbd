// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/TelephonyService.h"

#include <cstdint>
#include <span>
#include <string_view>

/// Which technologies want which log codes. The build generates the table from the decoders' sections (see
/// Tools/ListSections), so that this room needs no decoder.

namespace velmora {

/// The binary log technologies, of which sets are made, one bit each: all but IFX.
inline constexpr unsigned technologyBits = voxTechnologies.size() - 1;

/// A log code (see LogMessage::logCode) and the set of technologies whose decoders want it.
struct LogCodeRow {
    std::uint32_t code;
    std::uint8_t technologies;
};

/// Every log code that a decoder wants, in ascending order. Generated.
[[nodiscard]] std::span<const LogCodeRow> logCodeRows();

/// The short name of the technology of a bit, which is counted from 0. Generated.
[[nodiscard]] std::string_view technologyOfBit(unsigned bit);

/// The technologies whose decoders want a log code, as a set.
[[nodiscard]] std::uint8_t technologiesOfCode(std::uint32_t logCode);

} // namespace velmora
