// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <optional>
#include <string>
#include <string_view>

/// What every message says of the modem, as the sections' first row shows it.
namespace velmora::LiveModem {

/// Why there is nothing to report: no modem and why, a failed or a locked one; absent where the modem works.
[[nodiscard]] std::optional<std::string> troubleOf(const Dictionary& message);
/// Whether the message says that there is no modem, so that nothing else of it counts.
[[nodiscard]] bool isModemAbsent(const Dictionary& message);
/// The state of a modem that works: "Registered".
[[nodiscard]] std::string workingState(const Dictionary& message);

/// Why the modem reports no cells: "Cells not reported: not supported by this modem"; absent where it does.
[[nodiscard]] std::optional<std::string> cellTrouble(const Dictionary& message);
/// The same of neighbours, where it reports cells.
[[nodiscard]] std::optional<std::string> neighborTrouble(const Dictionary& message);

} // namespace velmora::LiveModem
