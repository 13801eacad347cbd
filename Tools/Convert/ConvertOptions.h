// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Messages/MessageSelection.h"

#include <string>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log convert`: a file of log messages in another form. The new file is renamed into place when
/// complete, so that no failure leaves part of one.
struct ConvertOptions {
    std::string file; ///< "-" for standard input
    /// The output; precondition: its name has a form, see `formFromName`.
    std::string out;
    MessageSelection messages;
    bool force = false;      ///< replace an existing file
    std::string technology;  ///< overrides the file's; empty for the file's
    std::string description; ///< a snapshot's
    bool isStrict = false;   ///< for a snapshot: see DecodeOptions
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addConvert(CLI::App& app, ConvertOptions& options);

} // namespace velmora
