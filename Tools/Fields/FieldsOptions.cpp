// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Fields/FieldsOptions.h"

#include "Platform/TelephonyService.h"
#include "Tools/CommandOptions.h"
#include "Tools/Technologies.h"

#include <CLI/CLI.hpp>

namespace velmora {

namespace {

/// Accepts the texts of which `read` makes a value.
template <class Read>
CLI::Validator readableBy(Read read) {
    return CLI::Validator(
        [read](const std::string& text) {
            const auto result = read(text);
            return result ? std::string() : result.reason();
        },
        "");
}

} // namespace

CLI::App* addFields(CLI::App& app, FieldsOptions& options) {
    CLI::App* command = app.add_subcommand(
        "fields", "List what the displays can show, where it is in the log records, and in "
                  "what unit");
    addTechnologyOption(*command, options.technology, "Only the fields of this technology, not of all");
    command
        ->add_option_function<std::string>(
            "--role",
            [&options](const std::string& name) {
                if (const Result<RoleSelection> roles = RoleSelection::named(name))
                    options.roles = *roles;
            },
            "Only the fields of this role, as in serving.level, or of all roles with this part before the "
            "dot, as in serving")
        ->check(readableBy(RoleSelection::named))
        ->type_name("ROLE");
    command
        ->add_option_function<std::string>(
            "--format",
            [&options](const std::string& name) {
                using Format = FieldsOptions::Format;
                options.format = name == "json" ? Format::Json : name == "csv" ? Format::Csv : Format::Text;
            },
            "text (the default): path, kind and unit, role and log codes of each field; json: one object "
            "with all that is known of each; csv: the same, a row each")
        ->check(oneOf({"text", "json", "csv"}))
        ->type_name("text|json|csv");
    addSafe(*command, options.guard);
    command->callback([&options] { checkSafe(options.guard, options.format == FieldsOptions::Format::Csv); });
    command->footer("A * in a path stands for each row of a list. The json conforms to\n"
                    "velmora-log-fields.schema.json.\n\n"
                    "Examples:\n"
                    "  velmora-log fields --role serving\n"
                    "  velmora-log fields --technology LTE --format csv > lte.csv\n"
                    "  velmora-log fields --format json | jq '.fields[] | select(.unit == \"dBm\") | .path'");
    return command;
}

} // namespace velmora
