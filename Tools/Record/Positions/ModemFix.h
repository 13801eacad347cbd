// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Clock.h"
#include "Platform/Fix.h"

#include <optional>

namespace velmora {

/// The position that a message of the technology Modem reports, at the time when it arrived; none where it
/// reports none.
[[nodiscard]] std::optional<Fix> fixOfModemMessage(Bytes message, Time arrival);

} // namespace velmora
