// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Watch/WatchOptions.h"

#include "Tools/CommandOptions.h"

namespace velmora {

CLI::App* addWatch(CLI::App& app, WatchOptions& options) {
    CLI::App* command = app.add_subcommand("watch", "Show what the telephony service reports, live");
    CLI::Option* const once = command->add_flag("--once", options.once, "Print the first refresh and exit");
    command
        ->add_option("--timeout", options.timeout_seconds,
                     "With --once: end with status 1 if there is no refresh after this time, as without a "
                     "telephony service; the default is to wait")
        ->needs(once)
        ->check(positiveSeconds())
        ->type_name("SECONDS");
    command
        ->add_option_function<std::string>(
            "--bell", [&options](const std::string& text) { options.bell = severityNamed(text); },
            "On a terminal: ring the bell for each event of at least this severity; the default is warning")
        ->expected(0, 1)
        ->default_str("warning")
        ->check(oneOf({"info", "warning", "critical"}))
        ->type_name("info|warning|critical");
    addMaskOption(*command, options.mask);
    command->footer(
        "On a terminal the screen is redrawn in place: arrows, j, k, PgUp, PgDn, Home and End scroll, / n N\n"
        "search, f shows only rows with a text, ] [ go to the next and previous section, q quits; a line\n"
        "above the last one has the latest events. On a pipe each refresh is printed, one after "
        "another.\n\n" +
        std::string(maskHelp) +
        "\n"
        "Examples:\n"
        "  velmora-log watch\n"
        "  velmora-log watch --mask\n"
        "  velmora-log watch --bell critical\n"
        "  velmora-log watch --once | grep -A20 'Serving Cell'");
    return command;
}

} // namespace velmora
