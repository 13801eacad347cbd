// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/Cell.h"
#include "Platform/Bytes.h"

#include <vector>

namespace velmora {

/// Reads the binary form of the cell information array as the telephony service writes it: an array of
/// dictionaries whose values are short ASCII strings and integers of up to 64 bits. Appends the cells.
/// Everything else - false - is left to the property-list reader; what this reader accepts, that one would
/// accept with the same result.
[[nodiscard]] bool readBinaryCells(Bytes list, std::vector<Cell>& cells);

} // namespace velmora
