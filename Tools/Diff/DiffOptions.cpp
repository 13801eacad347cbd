// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Diff/DiffOptions.h"

#include "Tools/CommandOptions.h"
#include "Tools/Messages/SelectionOptions.h"
#include "Tools/Stats/ChoiceOptions.h"

namespace velmora {

namespace {

void addInput(CLI::App& command, const std::string& name, DiffInput& input, const std::string& description) {
    command
        .add_option_function<std::string>(
            name, [&input](const std::string& text) { input = DiffInput::of(text); }, description)
        ->required()
        ->type_name("");
}

void checkTogether(const DiffOptions& options) {
    if (options.a.file == "-" && options.b.file == "-")
        throw CLI::ValidationError("B", "got - for both, wanted a file: standard input is read once");
}

} // namespace

CLI::App* addDiff(CLI::App& app, DiffOptions& options) {
    CLI::App* command =
        app.add_subcommand("diff", "Compare two displays, or the statistics of two recordings");
    addInput(*command, "A", options.a, "A recording, snapshot or DLF log, or FILE@TIME; - is standard input");
    addInput(*command, "B", options.b, "What it is compared with");
    command
        ->add_option_function<std::string>(
            "--format",
            [&options](const std::string& name) {
                options.format = name == "json" ? DiffOptions::Format::Json : DiffOptions::Format::Text;
            },
            "text (the default): tables for people; json: one object")
        ->check(oneOf({"text", "json"}))
        ->type_name("text|json");
    command->add_flag("--display", options.comparesDisplays,
                      "Compare what recordings show at their ends, not their statistics");
    addChoice(*command, options.selection, options.roles);
    addClock(*command, options.clock);
    addTechnology(*command, options.technology, "Decode as");
    command->footer(
        "Snapshots, and recordings at a TIME, are compared by what they show: values that were added, are "
        "gone\n"
        "or have changed, with the difference of numbers; rows of lists by what identifies them (channel "
        "and\n"
        "cell), wherever they are. Two recordings are compared by their statistics (see stats). The exit "
        "status\n"
        "does not depend on the differences. The json conforms to velmora-log-diff.schema.json.\n\n" +
        std::string(timeHelp) +
        "\nExamples:\n"
        "  velmora-log diff before.velmora after.velmora\n"
        "  velmora-log diff drive.pcapng@+60 drive.pcapng@+120\n"
        "  velmora-log diff drive.pcapng@2026-11-16T05:00:00Z drive.pcapng --select '/GSM/Neighboring "
        "Cells'\n"
        "  velmora-log diff --role serving monday.pcapng tuesday.pcapng\n"
        "  velmora-log diff --format json a.velmora b.velmora | jq '.differences[] | .path'");
    command->callback([&options] { checkTogether(options); });
    return command;
}

} // namespace velmora
