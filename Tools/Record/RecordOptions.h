// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log record`: the telephony service's messages, as they arrive, into a recording.
struct RecordOptions {
    std::string file;   ///< "-" for standard output
    bool force = false; ///< overwrite an existing file
    std::optional<double> duration_seconds;
    std::optional<std::uint64_t> count;    ///< messages
    std::string positions;                 ///< as `--gps` has it; empty for none
    std::optional<double> timeout_seconds; ///< how long to wait for a service at the start
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addRecord(CLI::App& app, RecordOptions& options);

} // namespace velmora
