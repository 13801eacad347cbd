// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/BrowseOptions.h"

#include "Tools/CommandOptions.h"

namespace velmora {

CLI::App* addBrowse(CLI::App& app, BrowseOptions& options) {
    CLI::App* command = app.add_subcommand(
        "browse", "Look into a recording: its messages, the display as of each, its bytes, its events");
    command->add_option("FILE", options.files, "Recordings, snapshots or DLF logs")
        ->required()
        ->type_name("");
    command->add_flag("--line", options.byLine,
                      "Lines of text in place of a screen, for screen readers and pipes: commands are read "
                      "from standard input, a line each");
    addTechnology(*command, options.technology, "Show the messages of");
    addMaskOption(*command, options.mask);
    command->footer(
        "Keys: arrows, PgUp, PgDn, Home and End move, Tab goes to the next part, / n N search,\n"
        "f filters by a condition as rules have them or by log codes, e E go to events, t to a\n"
        "time, m writes a note, v marks a range, w writes it to a new recording, y copies, T shows the\n"
        "next technology of the file, ? lists all keys, q quits. The files are never changed.\n\n"
        "Colours are left out where NO_COLOR is set.\n\n"
        "With --mask everything is masked: the bytes and the recordings that w writes as well as values. "
        "Notes\n"
        "of the file are not shown; those that m writes stay as they are.\n\n"
        "Examples:\n"
        "  velmora-log browse drive.pcapng\n"
        "  velmora-log browse --technology Ostrel_LTE modem.dlf\n"
        "  velmora-log browse --mask=location drive.pcapng\n"
        "  printf 't 05:02:40\\nd\\n' | velmora-log browse --line drive.pcapng");
    return command;
}

} // namespace velmora
