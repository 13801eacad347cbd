// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <optional>
#include <string>

namespace velmora::LiveModem {

/// Each makes a text of a mask of ModemManager's: the names of its bits, the lowest first, with ", " between
/// them. Bits without a name follow in hexadecimal. Absent for an empty mask and for what is none.
[[nodiscard]] std::optional<std::string> accessTechnologies(const Value& mask);
[[nodiscard]] std::optional<std::string> capabilities(const Value& mask);
[[nodiscard]] std::optional<std::string> addressFamilies(const Value& mask);

} // namespace velmora::LiveModem
