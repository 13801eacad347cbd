// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

namespace velmora {

class Output;

/// `velmora-log info`: what a file of log messages holds, and what is wrong with it.
struct InfoOptions {
    std::string file;
    std::string technology; ///< before the one that the file names; empty for that one
};

/// The exit status.
[[nodiscard]] int runInfo(const InfoOptions& options, Output& output);

} // namespace velmora
