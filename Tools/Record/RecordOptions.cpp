// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Record/RecordOptions.h"

#include "Tools/CommandOptions.h"

namespace velmora {

namespace {

/// At most what the event loop's timers hold, which is 24 days.
CLI::Validator validSeconds() {
    return wants(
        [](const std::string& text) {
            double seconds = 0;
            return CLI::detail::lexical_cast(text, seconds) && seconds >= 0.001 && seconds <= 2e6;
        },
        "seconds from 0.001 to 2000000");
}

} // namespace

CLI::App* addRecord(CLI::App& app, RecordOptions& options) {
    CLI::App* command =
        app.add_subcommand("record", "Record the telephony service's messages until interrupted");
    command->add_option("FILE", options.file, "Where to; - is standard output")->required()->type_name("");
    command->add_flag("--force", options.force, "Overwrite FILE where there is one");
    command
        ->add_option("--duration", options.duration_seconds, "Stop after this time, counted from the start")
        ->check(validSeconds())
        ->type_name("SECONDS");
    command->add_option("--count", options.count, "Stop after this many messages")
        ->check(positiveCount())
        ->type_name("N");
    command->footer(
        "What arrives is on its way to the disk within half a second. When FILE cannot be written or the\n"
        "service goes away, that is told at once; up to 32 MiB of messages wait, and recording goes on\n"
        "when it can. Messages that are missing in the end make the exit status 1.\n\n"
        "Examples:\n"
        "  velmora-log record drive.pcapng\n"
        "  velmora-log record --duration 600 --force drive.pcapng\n"
        "  velmora-log record - | velmora-log info -");
    return command;
}

} // namespace velmora
