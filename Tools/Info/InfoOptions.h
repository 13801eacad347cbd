// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log info`: what a file of log messages holds, and its damage.
struct InfoOptions {
    std::string file;
    std::string technology; ///< overrides the file's; empty for the file's
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addInfo(CLI::App& app, InfoOptions& options);

} // namespace velmora
