// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Info/InfoOptions.h"

#include "Tools/CommandOptions.h"

namespace velmora {

CLI::App* addInfo(CLI::App& app, InfoOptions& options) {
    CLI::App* command = app.add_subcommand("info", "List what is in a recording: times, log codes, losses");
    command->add_option("FILE", options.files, "Recordings, snapshots or DLF logs; - is standard input")
        ->required()
        ->type_name("");
    command
        ->add_option_function<std::string>(
            "--format",
            [&options](const std::string& name) {
                options.format = name == "json" ? InfoOptions::Format::Json : InfoOptions::Format::Text;
            },
            "text (the default): for people, under the files' names where there are several; json: an object "
            "for each file")
        ->check(oneOf({"text", "json"}))
        ->type_name("text|json");
    addTechnology(*command, options.technology, "Name the log codes of");
    command->footer("The technologies of a file of several are listed one by one. The JSON conforms to\n"
                    "velmora-log-info.schema.json.\n\n"
                    "Examples:\n"
                    "  velmora-log info drive.pcapng\n"
                    "  velmora-log info --format json monday/*.pcapng | jq '.technologies[].messages'\n"
                    "  velmora-log info --technology Ostrel_LTE modem.dlf");
    return command;
}

} // namespace velmora
