// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log convert`: a file of log messages in another form. The new file takes its place in one step
/// when it is whole, so that no failure leaves half of one.
struct ConvertOptions {
    std::string file; ///< "-" for standard input
    /// What it becomes; precondition: it has a form, see `formFromName`.
    std::string out;
    bool force = false;      ///< replace a file that is there
    std::string technology;  ///< before the one that the file names; empty for that one
    std::string description; ///< a snapshot's
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addConvert(CLI::App& app, ConvertOptions& options);

} // namespace velmora
