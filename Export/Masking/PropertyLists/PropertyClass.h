// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskReport.h"
#include "Export/Masking/PropertyLists/PropertyKeys.h"

#include <optional>

namespace velmora {

/// Whom a value of that form identifies; absent where it is no identity.
[[nodiscard]] std::optional<Masked> classOf(PropertyForm form);

} // namespace velmora
