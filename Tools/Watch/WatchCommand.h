// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

class Output;

/// `velmora-log watch`: the display tree of what the telephony service reports, kept up to date.
struct WatchOptions {
    bool once = false; ///< print the first refresh and end
};

/// The exit status. Draws on the terminal where standard output is one, prints each refresh to `output`
/// otherwise.
[[nodiscard]] int runWatch(const WatchOptions& options, Output& output);

} // namespace velmora
