// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"
#include "Tools/Mask/MaskOption.h"

#include <optional>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log watch`: the display tree of what the telephony service reports, kept up to date.
struct WatchOptions {
    bool once = false;                     ///< print the first refresh and end
    std::optional<double> timeout_seconds; ///< with `once`: how long to wait for that
    std::optional<Severity> bell;          ///< the bell rings for events of at least this severity
    MaskOption mask;
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addWatch(CLI::App& app, WatchOptions& options);

} // namespace velmora
