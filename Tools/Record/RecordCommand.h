// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace velmora {

class Output;

/// `velmora-log record`: the telephony service's messages, as they arrive, into a recording.
struct RecordOptions {
    std::string file;   ///< "-" for standard output
    bool force = false; ///< overwrite a file that is there
    std::optional<double> duration_seconds;
    std::optional<std::uint64_t> count; ///< messages
};

/// The exit status.
[[nodiscard]] int runRecord(const RecordOptions& options);

} // namespace velmora
