// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Columns/ColumnsOptions.h"

#include "Tools/CommandOptions.h"

#include <CLI/CLI.hpp>

namespace velmora {

CLI::App* addColumns(CLI::App& app, ColumnsOptions& options) {
    CLI::App* command = app.add_subcommand(
        "columns", "Write what recordings report as Parquet files, a table for each section and list");
    command->add_option("FILE", options.files, "Recordings, snapshots or DLF logs; - is standard input")
        ->type_name("");
    command->add_option("--out", options.out, "The directory of the tables; it is made if it does not exist")
        ->type_name("DIR");
    command
        ->add_option("--compact", options.compact,
                     "Join the small files of each table, technology and day in this directory instead")
        ->type_name("DIR");
    addTechnologyOption(*command, options.technology, "The technology of files that do not name theirs");
    addMaskOption(*command, options.mask);
    command->callback([&options] {
        if (options.out.empty() == options.compact.empty())
            throw CLI::ValidationError("columns", options.out.empty()
                                                      ? "got neither --out nor --compact, wanted one of them"
                                                      : "got both --out and --compact, wanted one of them");
        if (!options.out.empty() && options.files.empty())
            throw CLI::ValidationError("--out", "got no FILE, wanted at least one");
        if (!options.compact.empty() && !options.files.empty())
            throw CLI::ValidationError("--compact", "got " + options.files.front() + ", wanted no FILE");
        if (!options.compact.empty() && options.mask.level)
            throw CLI::ValidationError("--compact", "got --mask too, wanted one of the two");
    });
    command->footer(
        "A FILE becomes DIR/TABLE/technology=T/date=D/HASH.parquet for each of its tables: T is its "
        "technology,\n"
        "D the day in UTC of its first message, HASH that of its content. A FILE whose tables are there "
        "already\n"
        "is left alone, so that the same command continues where it was interrupted. Each file is complete "
        "or "
        "does\n"
        "not exist. A line for each FILE says what was done; losses in one give exit status 1, and the rest "
        "of it\n"
        "is written. Let nothing else write to DIR, or read it, while --compact works on it.\n\n"
        "--mask masks what identifies the subscriber, --mask=location the network and its areas too, "
        "--mask=all\n"
        "positions and times too, as velmora-log mask does; times are then counted from 2000-01-01, and D is "
        "that\n"
        "day. HASH is then that of level and key too: the same command continues where it has the same "
        "--key.\n\n"
        "Examples:\n"
        "  velmora-log columns --out week monday/*.pcapng tuesday/*.pcapng\n"
        "  velmora-log columns --mask=location --key fleet.key --out shared monday/*.pcapng\n"
        "  velmora-log columns --compact week\n"
        "  duckdb -c \"SELECT * FROM 'week/messages/**/*.parquet' LIMIT 5\"");
    return command;
}

} // namespace velmora
