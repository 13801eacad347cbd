// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

namespace velmora {

/// Whether two values show and are saved the same. Unlike ==, it takes a real that is no number for one that
/// is none either.
[[nodiscard]] bool sameValue(const Value& a, const Value& b);

} // namespace velmora
