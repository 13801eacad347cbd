// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "PropertyLists/BinaryObjectTable.h"
#include "PropertyLists/Value.h"

namespace velmora {

/// The values of objects of fixed size in a binary property list. Each fails for a marker that the format
/// does not have, and for an object that reaches past the objects' end; the reason has the object's offset.
[[nodiscard]] Result<Value> binaryInteger(const BinaryObjectTable& table, const BinaryObject& object);
[[nodiscard]] Result<Value> binaryReal(const BinaryObjectTable& table, const BinaryObject& object);
[[nodiscard]] Result<Value> binaryDate(const BinaryObjectTable& table, const BinaryObject& object);

} // namespace velmora
