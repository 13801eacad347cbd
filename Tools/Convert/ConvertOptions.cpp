// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Convert/ConvertOptions.h"

#include "Tools/CommandOptions.h"
#include "Tools/Convert/Conversion.h"
#include "Tools/Messages/SelectionOptions.h"

#include <string>

namespace velmora {

CLI::App* addConvert(CLI::App& app, ConvertOptions& options) {
    CLI::App* command =
        app.add_subcommand("convert", "Convert a recording, snapshot or DLF log to another form");
    command->add_option("FILE", options.file, "What to convert; - is standard input")
        ->required()
        ->type_name("");
    command
        ->add_option("OUT", options.out,
                     "The output; its suffix selects the form: .pcapng a recording, .velmora a snapshot, "
                     ".dlf a DLF log")
        ->required()
        ->check(validator([](const std::string& name) { return formFromName(name).has_value(); },
                          std::string("a name that ends in ") + formSuffixes))
        ->type_name("");
    command->add_flag("--force", options.force, "Overwrite OUT if it exists");
    addSelection(*command, options.messages,
                 "; a snapshot's displays start cold: what the others leave is missing");
    addTechnology(*command, options.technology, "Convert as");
    command->add_option("--description", options.description, "A snapshot's description; empty by default")
        ->type_name("TEXT");
    command->add_flag("--strict", options.isStrict,
                      "For a snapshot: end at a message that ends the application; by default it is counted, "
                      "reported and left out");
    command->footer(
        "A recording holds all messages with their times, a DLF log all messages; a snapshot is the one\n"
        "that the application would have written after the last message: the last five displays with the\n"
        "messages before each. OUT is complete or does not exist. Losses in FILE are reported and give\n"
        "exit status 1; the rest is converted.\n\n" +
        std::string(timeHelp) +
        "\nExamples:\n"
        "  velmora-log convert drive.pcapng drive.velmora --description 'gate 4, roof'\n"
        "  velmora-log convert --from +60 --to +120 --code 0x512C drive.pcapng minute.pcapng\n"
        "  velmora-log convert --technology Ostrel_LTE modem.dlf modem.pcapng\n"
        "  velmora-log record - | velmora-log convert - drive.dlf");
    return command;
}

} // namespace velmora
