// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Mask/MaskCommandOptions.h"

#include "Tools/CommandOptions.h"
#include "Tools/Convert/Conversion.h"

#include <string>

namespace velmora {

CLI::App* addMask(CLI::App& app, MaskCommandOptions& options) {
    CLI::App* command =
        app.add_subcommand("mask", "Copy a recording, snapshot or DLF log without identities, or check one");
    CLI::Option* file =
        command->add_option("FILE", options.file, "What to mask; - is standard input")->type_name("");
    CLI::Option* out = command
                           ->add_option("OUT", options.out,
                                        "The output; its suffix selects the form: .pcapng a recording, "
                                        ".velmora a snapshot, .dlf a DLF log")
                           ->check(validator(
                               [](const std::string& name) {
                                   const auto form = formFromName(name);
                                   return form && holdsMessages(*form);
                               },
                               std::string("a name that ends in ") + messageSuffixes))
                           ->type_name("");
    command
        ->add_option_function<std::string>(
            "--level",
            [&options](const std::string& name) {
                options.level = maskLevelNamed(name).value_or(MaskLevel::Identity);
            },
            "What is masked: who the subscriber is; the network, its areas and cells too; positions and "
            "times "
            "too. The default is identity")
        ->check(oneOf({"identity", "location", "all"}))
        ->type_name("identity|location|all");
    CLI::Option* key =
        command
            ->add_option(
                "--key", options.keyFile,
                "A key that --new-key made: the same values become the same pseudonyms in all files; the "
                "default is a random key that is forgotten")
            ->type_name("FILE");
    addTechnology(*command, options.technology, "Mask as");
    CLI::Option* keep = command->add_flag(
        "--keep-unknown", options.keepsUnknown,
        "Keep what is not known to be harmless: messages of unknown codes, SIM files, keys and bytes");
    CLI::Option* report = command->add_flag("--report", options.reports,
                                            "Print what was masked and removed, by class and count");
    CLI::Option* force = command->add_flag("--force", options.force, "Overwrite OUT if it exists");
    CLI::Option* newKey =
        command
            ->add_option("--new-key", options.newKey,
                         "Make a file with a random key, for its user alone, and do nothing else")
            ->type_name("FILE");
    CLI::Option* check = command->add_flag("--check", options.checks,
                                           "Do not mask: report which identities FILE has in clear, exit "
                                           "status 1 if any");
    CLI::Option* known =
        command
            ->add_option("--known", options.knownFile,
                         "With --check, look for these values too, one a line, in any encoding")
            ->type_name("FILE");
    // Not by the options themselves, whose help would be longer than what it says.
    command->callback([=, &options] {
        for (CLI::Option* const alone : {newKey, check})
            for (CLI::Option* const other : {newKey, check, file, out, key, keep, report, force})
                if (alone->count() != 0 && other->count() != 0 && other != alone &&
                    !(alone == check && other == file))
                    throw CLI::ExcludesError(alone->get_name(), other->get_name());
        if (known->count() != 0 && check->count() == 0)
            throw CLI::RequiresError(known->get_name(), check->get_name());
        if (options.newKey.empty() && options.file.empty())
            throw CLI::RequiredError("FILE");
        if (options.newKey.empty() && !options.checks && options.out.empty())
            throw CLI::RequiredError("OUT");
    });
    command->footer(
        "Masked are the numbers of subscriber, SIM and phone, phone numbers, addresses and temporary\n"
        "identities; what is not known to be harmless is removed, and so are descriptions, comments and\n"
        "blocks of other programs. Pseudonyms have the form of what they stand for.\n\n"
        "Not hidden: level identity does not hide where the phone was; neighbour lists, channels and levels\n"
        "identify places at every level; level location keeps positions, if a message has them; times can\n"
        "show who was there, unless the level is all. The holder of the key finds values again by trial.\n\n"
        "OUT is complete or does not exist. Losses in FILE are reported and give exit status 1; the rest is\n"
        "masked.\n\n"
        "Examples:\n"
        "  velmora-log mask drive.pcapng shared.pcapng --report\n"
        "  velmora-log mask --check shared.pcapng\n"
        "  velmora-log mask --new-key fleet.key\n"
        "  velmora-log mask --level location --key fleet.key drive.velmora shared.velmora");
    return command;
}

} // namespace velmora
