// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Record/RecordOptions.h"

namespace velmora {

/// Returns the exit status.
[[nodiscard]] int runRecord(const RecordOptions& options);

} // namespace velmora
