// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Record/RecordOptions.h"

#include "Tools/CommandOptions.h"

namespace velmora {

namespace {

/// Months of the fastest modem; what is above is a slip of the finger.
constexpr std::uint64_t maximumCount = 1'000'000'000'000;

} // namespace

CLI::App* addRecord(CLI::App& app, RecordOptions& options) {
    CLI::App* command =
        app.add_subcommand("record", "Record the telephony service's messages until interrupted");
    command->add_option("FILE", options.file, "Where to; - is standard output")->required()->type_name("");
    command->add_flag("--force", options.force, "Overwrite FILE if it exists");
    command->add_option("--duration", options.duration_seconds, "Stop this long after the start")
        ->check(positiveSeconds())
        ->type_name("SECONDS");
    command
        ->add_option("--count", options.count,
                     "Stop after this many messages; with status 1 when the service's source ends before")
        ->check(countUpTo(maximumCount))
        ->type_name("N");
    command
        ->add_option(
            "--timeout", options.timeout_seconds,
            "End with status 1 if no telephony service has answered after this time; the default is to "
            "wait")
        ->check(positiveSeconds())
        ->type_name("SECONDS");
    command
        ->add_option(
            "--gps", options.positions,
            "Record positions as well: of gpsd (gpsd:HOST:PORT; localhost:2947 by default); modem: as the "
            "modem reports them; a file: GPX or NMEA sentences by their time, or a device or pipe that "
            "NMEA sentences come from")
        ->type_name("gpsd[:HOST[:PORT]]|modem|FILE");
    command->footer(
        "Messages are written, and their sync to storage started, within half a second. A failed write\n"
        "and a lost service are reported immediately; up to 32 MiB of messages are queued, and recording\n"
        "continues when it can. The exit status is 1 if messages are missing at the end.\n\n"
        "The file is locked. If others remove, move, replace, truncate or write to it, recording goes on "
        "into\n"
        "a new file beside it, such as drive-2.pcapng, and the exit status is 1.\n\n"
        "Examples:\n"
        "  velmora-log record drive.pcapng\n"
        "  velmora-log record --gps gpsd drive.pcapng\n"
        "  velmora-log record --duration 600 --force drive.pcapng\n"
        "  velmora-log record - | velmora-log info -");
    return command;
}

} // namespace velmora
