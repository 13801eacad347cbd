// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Report/ReportOptions.h"

#include "Tools/CommandOptions.h"
#include "Tools/Stats/ChoiceOptions.h"

namespace velmora {

CLI::App* addReport(CLI::App& app, ReportOptions& options) {
    CLI::App* command =
        app.add_subcommand("report", "Make one HTML page of recordings: charts, events, cells, statistics");
    command
        ->add_option("FILE", options.files,
                     "Recordings that follow each other; two are compared; - is standard input")
        ->required()
        ->type_name("");
    command->add_option("-o,--output", options.out, "The page")->required()->type_name("OUT");
    command->add_flag("--force", options.force, "Overwrite OUT if it exists");
    command->add_flag(
        "--with-identities", options.hasIdentities,
        "Keep what identifies the subscriber and the phone, and their addresses, which the page "
        "leaves out otherwise");
    command
        ->add_option("--rules", options.rules,
                     "Rules of this file, too; they replace others of the same name; may be repeated")
        ->expected(1)
        ->allow_extra_args(false) // a FILE may follow
        ->multi_option_policy(CLI::MultiOptionPolicy::TakeAll)
        ->type_name("FILE");
    command->add_flag_callback(
        "--no-rules", [&options] { options.usesStandardRules = false; },
        "Leave out the built-in rules and those in ~/.config/velmora/rules");
    addClock(*command, options.clock);
    addTechnology(*command, options.technology, "Decode as");
    addMaskOption(*command, options.mask);
    command->footer(
        "The page needs no network and nothing beside itself: it can be mailed, printed, and read without\n"
        "scripts. It holds what it shows as JSON, too. Cells and areas, and so places, are in it\n"
        "unless --mask=location is given.\n\n" +
        std::string(maskHelp) +
        "\n"
        "OUT is complete or does not exist, and is for its user alone (mode 0600). What cannot be read or\n"
        "decoded is reported, on the page as well, and gives exit status 1.\n\n"
        "Examples:\n"
        "  velmora-log report drive.pcapng -o drive.html\n"
        "  velmora-log report before.pcapng after.pcapng -o comparison.html\n"
        "  velmora-log report --mask=location drive.pcapng -o shared.html");
    return command;
}

} // namespace velmora
