// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log info`: what files of log messages hold, and their damage.
struct InfoOptions {
    enum class Format { Text, Json };

    Format format = Format::Text;
    std::string technology; ///< overrides the file's, or chooses one of several; empty for the file's
    std::vector<std::string> files;
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addInfo(CLI::App& app, InfoOptions& options);

} // namespace velmora
