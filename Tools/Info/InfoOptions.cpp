// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Info/InfoOptions.h"

#include "Tools/CommandOptions.h"

namespace velmora {

CLI::App* addInfo(CLI::App& app, InfoOptions& options) {
    CLI::App* command = app.add_subcommand("info", "List what is in a recording: times, log codes, losses");
    command->add_option("FILE", options.file, "A recording, snapshot or DLF log; - is standard input")
        ->required()
        ->type_name("");
    addTechnology(*command, options.technology, "Name the log codes of");
    command->footer("Examples:\n"
                    "  velmora-log info drive.pcapng\n"
                    "  velmora-log info --technology Ostrel_LTE modem.dlf");
    return command;
}

} // namespace velmora
