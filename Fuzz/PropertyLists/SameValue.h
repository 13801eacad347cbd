// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

namespace velmora {

/// Whether two values are shown and saved the same. Unlike ==, it treats NaN as equal to NaN.
[[nodiscard]] bool sameValue(const Value& a, const Value& b);

} // namespace velmora
