// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskLevel.h"

#include <string>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log mask`: a file of log messages without identities; also the keys for it, and the check of what
/// is left.
struct MaskCommandOptions {
    std::string file; ///< "-" for standard input
    std::string out;  ///< precondition, where it is not empty: its name has a form, see `formFromName`
    MaskLevel level = MaskLevel::Identity;
    std::string keyFile; ///< empty for a key that is forgotten
    std::string technology;
    bool keepsUnknown = false;
    bool reports = false;
    bool force = false;
    std::string newKey;    ///< the file that is made; not empty: nothing else is done
    bool checks = false;   ///< `file` is checked, and nothing else is done
    std::string knownFile; ///< values to look for, one a line; empty for none
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addMask(CLI::App& app, MaskCommandOptions& options);

} // namespace velmora
