// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/PropertyList.h"

#include <ostream>

#include <rapidcheck.h>

namespace velmora {

/// The value as text, for a failure's report.
void showValue(const Value& value, std::ostream& out);

/// A property-list value of every kind but none, nested a few levels deep, that both forms can represent: its
/// texts are UTF-8 without the control characters that XML lacks, its dates lie in the years 0001 to 9999.
[[nodiscard]] rc::Gen<Value> givenValue();

/// A dictionary of texts, of lists and of dictionaries of these.
[[nodiscard]] rc::Gen<Value> givenTextTree();

} // namespace velmora
