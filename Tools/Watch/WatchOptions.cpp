// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Watch/WatchOptions.h"

#include <CLI/CLI.hpp>

namespace velmora {

CLI::App* addWatch(CLI::App& app, WatchOptions& options) {
    CLI::App* command = app.add_subcommand("watch", "Show what the telephony service reports, live");
    command->add_flag("--once", options.once, "Print the first refresh and exit");
    command->footer(
        "On a terminal the screen is redrawn in place: arrows, j, k, PgUp, PgDn, Home and End scroll,\n"
        "q quits. On a pipe each refresh is printed, one after another.\n\n"
        "Examples:\n"
        "  velmora-log watch\n"
        "  velmora-log watch --once | grep -A20 'Serving Cell'");
    return command;
}

} // namespace velmora
