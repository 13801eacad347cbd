// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogCodes.h"

#include <algorithm>

namespace velmora {

std::uint8_t technologiesOfCode(std::uint32_t logCode) {
    const std::span<const LogCodeRow> rows = logCodeRows();
    const auto row = std::ranges::lower_bound(rows, logCode, {}, &LogCodeRow::code);
    return row != rows.end() && row->code == logCode ? row->technologies : std::uint8_t{0};
}

} // namespace velmora
