// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Convert/ConvertOptions.h"

#include "Tools/CommandOptions.h"
#include "Tools/Convert/Conversion.h"

namespace velmora {

CLI::App* addConvert(CLI::App& app, ConvertOptions& options) {
    CLI::App* command =
        app.add_subcommand("convert", "Make another form of a recording, snapshot or DLF log");
    command->add_option("FILE", options.file, "What to convert; - is standard input")
        ->required()
        ->type_name("");
    command
        ->add_option(
            "OUT", options.out,
            "What it becomes, by its suffix: .pcapng a recording, .velmora a snapshot, .dlf a DLF log")
        ->required()
        ->check(wants([](const std::string& name) { return formFromName(name).has_value(); },
                      std::string("a name that ends in ") + formSuffixes))
        ->type_name("");
    command->add_flag("--force", options.force, "Overwrite OUT where there is one");
    addTechnology(*command, options.technology, "Convert as");
    command
        ->add_option("--description", options.description,
                     "What a snapshot says of itself; nothing, unless told otherwise")
        ->type_name("TEXT");
    command->footer(
        "A recording holds all messages with their times, a DLF log all messages; a snapshot is the one\n"
        "that the application would have written in the end: the last five displays with the messages\n"
        "behind them. OUT is there when it is whole, or not at all. What is lost of FILE is told, makes\n"
        "the exit status 1, and does not keep the rest from being converted.\n\n"
        "Examples:\n"
        "  velmora-log convert drive.pcapng drive.velmora --description 'gate 4, roof'\n"
        "  velmora-log convert --technology Ostrel_LTE modem.dlf modem.pcapng\n"
        "  velmora-log record - | velmora-log convert - drive.dlf");
    return command;
}

} // namespace velmora
