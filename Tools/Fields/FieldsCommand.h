// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Fields/FieldsOptions.h"

namespace velmora {

class Output;

/// Returns the exit status.
[[nodiscard]] int runFields(const FieldsOptions& options, Output& output);

} // namespace velmora
