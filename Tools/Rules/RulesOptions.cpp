// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Rules/RulesOptions.h"

#include "Tools/CommandOptions.h"

namespace velmora {

CLI::App* addRules(CLI::App& app, RulesOptions& options) {
    CLI::App* command = app.add_subcommand("rules", "Check the rules by which events are found");
    command
        ->add_option_function<std::string>(
            "ACTION",
            [&options](const std::string& name) {
                options.action = name == "test" ? RulesOptions::Action::Test : RulesOptions::Action::Check;
            },
            "check: report the mistakes of the files; test: run the tests that their rules carry too")
        ->check(oneOf({"check", "test"}))
        ->required()
        ->type_name("");
    command
        ->add_option("FILE", options.files,
                     "Rule files; without any the built-in rules and those of ~/.config/velmora/rules")
        ->type_name("");
    command->footer("A mistake is reported with file, line and column. Exit status: 1 for a mistake, or\n"
                    "where a rule makes other events than its test expects.\n\n"
                    "Examples:\n"
                    "  velmora-log rules check my.toml\n"
                    "  velmora-log rules test my.toml\n"
                    "  velmora-log rules test");
    return command;
}

} // namespace velmora
