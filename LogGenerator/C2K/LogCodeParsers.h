// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/LogCodeParser.h"

#include <cstddef>
#include <cstdint>
#include <span>

namespace velmora::C2K {

/// All parsers, in the order in which the start command names their codes.
[[nodiscard]] std::span<const LogCodeParser* const> logCodeParsers();

/// The index of a parser among them.
[[nodiscard]] std::size_t indexOf(const LogCodeParser& parser);

/// The parser of that code; null when there is none.
[[nodiscard]] const LogCodeParser* parserOfCode(std::uint32_t logCode);

} // namespace velmora::C2K
