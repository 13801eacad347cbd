// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"

namespace velmora {

/// What makes the raw number of a field a physical value: raw * scale + offset. For a value that a section
/// computes, raw is the number that it computes.
struct SourceNumber {
    double scale;
    double offset;
    bool isSigned; ///< the raw number is in two's complement
};

/// Precondition: the field's physical value is a number.
[[nodiscard]] SourceNumber numberOf(const Field& field);

} // namespace velmora
