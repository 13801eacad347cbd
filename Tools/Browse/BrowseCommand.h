// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Browse/BrowseOptions.h"

namespace velmora {

class Output;

/// Runs the command; returns the exit status.
[[nodiscard]] int runBrowse(const BrowseOptions& options, Output& output);

} // namespace velmora
