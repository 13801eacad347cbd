// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/CommandLine.h"

#include <vector>

namespace velmora {

/// The arguments without the program's name, parsed.
inline CommandLine parse(std::vector<const char*> arguments) {
    arguments.insert(arguments.begin(), "velmora-log");
    return parseCommandLine(static_cast<int>(arguments.size()), arguments.data());
}

} // namespace velmora
