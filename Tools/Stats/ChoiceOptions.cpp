// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Stats/ChoiceOptions.h"

#include "Tools/CommandOptions.h"

#include <string>
#include <vector>

namespace velmora {

void addChoice(CLI::App& command, NodeSelection& selection, RoleSelection& roles) {
    command
        .add_option_function<std::vector<std::string>>(
            "--select",
            [&selection](const std::vector<std::string>& paths) { selection = NodeSelection(paths); },
            "Only this part of the display, by a path of the names on the screens: "
            "\"/GSM/GSM Serving Cell/RSSI\", \"/GSM/Neighboring Cells/*/RSSI\"; \"level=/GSM/GSM Serving "
            "Cell/RSSI\" names it; may be repeated")
        ->check(validator(NodeSelection::isPath, "a path that begins with a slash"))
        ->expected(1)
        ->allow_extra_args(false) // a FILE may follow
        ->multi_option_policy(CLI::MultiOptionPolicy::TakeAll)
        ->type_name("PATH");
    command
        .add_option_function<std::string>(
            "--role",
            [&roles](const std::string& name) {
                if (const Result<RoleSelection> named = RoleSelection::named(name))
                    roles = *named;
            },
            "Only the fields of this role, as in serving.level, or of all roles with this part before the "
            "dot, as in serving")
        ->check(CLI::Validator(
            [](const std::string& name) {
                const Result<RoleSelection> named = RoleSelection::named(name);
                return named ? std::string() : named.reason();
            },
            ""))
        ->type_name("ROLE");
}

void addClock(CLI::App& command, AnalysisClock& clock) {
    command
        .add_option_function<std::string>(
            "--clock",
            [&clock](const std::string& name) {
                clock = name == "modem" ? AnalysisClock::Modem : AnalysisClock::Arrival;
            },
            "Whose times: arrival (the default), when messages arrived; modem, the time stamps that the "
            "modem gave them")
        ->check(oneOf({"arrival", "modem"}))
        ->type_name("arrival|modem");
}

} // namespace velmora
