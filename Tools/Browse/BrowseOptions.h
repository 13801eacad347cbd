// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Mask/MaskOption.h"

#include <string>
#include <vector>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log browse`: recordings in the terminal.
struct BrowseOptions {
    std::vector<std::string> files;
    std::string technology; ///< short name; empty for the first of each file
    bool byLine = false;    ///< lines of text in place of a screen
    MaskOption mask;
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addBrowse(CLI::App& app, BrowseOptions& options);

} // namespace velmora
