// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Stats/StatsOptions.h"

#include "Tools/CommandOptions.h"
#include "Tools/Messages/PositionOptions.h"
#include "Tools/Messages/SelectionOptions.h"
#include "Tools/Stats/ChoiceOptions.h"

#include <charconv>
#include <optional>
#include <string_view>
#include <system_error>

namespace velmora {

namespace {

/// "square:50m": the metres, from 1 to 100000.
std::optional<double> squareSize(std::string_view text) {
    constexpr std::string_view begin = "square:";
    constexpr double largest = 100'000;
    if (!text.starts_with(begin) || !text.ends_with('m'))
        return std::nullopt;
    text = text.substr(begin.size(), text.size() - begin.size() - 1);
    double size = 0;
    const auto read = std::from_chars(text.data(), text.data() + text.size(), size, std::chars_format::fixed);
    const bool isWhole = read.ec == std::errc() && read.ptr == text.data() + text.size();
    return isWhole && size >= 1 && size <= largest ? std::optional(size) : std::nullopt;
}

void checkTogether(const StatsOptions& options) {
    using Format = StatsOptions::Format;
    checkSafe(options.guard, options.format == Format::Csv);
    if (options.hasHistogram && options.format == Format::Csv)
        throw CLI::ValidationError("--histogram", "got --format csv too, wanted --format text or json");
}

void addFormat(CLI::App& command, StatsOptions& options) {
    command
        .add_option_function<std::string>(
            "--format",
            [&options](const std::string& name) {
                using Format = StatsOptions::Format;
                options.format = name == "json" ? Format::Json : name == "csv" ? Format::Csv : Format::Text;
            },
            "text (the default): tables for people; json: an object for each group; csv: a row for each "
            "field's numbers, and for each value of a state")
        ->check(oneOf({"text", "json", "csv"}))
        ->type_name("text|json|csv");
    addSafe(command, options.guard);
    command.add_flag("--histogram", options.hasHistogram,
                     "With text and json: how the numbers are distributed, in bins that their unit fixes");
}

} // namespace

CLI::App* addStats(CLI::App& app, StatsOptions& options) {
    CLI::App* command = app.add_subcommand(
        "stats", "Sum up what recordings report: levels, shares of time, the worst minute");
    command
        ->add_option("FILE", options.files,
                     "Recordings that follow each other; - is standard input, the default")
        ->type_name("");
    addFormat(*command, options);
    command
        ->add_option_function<std::string>(
            "--by",
            [&options](const std::string& name) {
                using By = StatisticsPlan::By;
                options.squareSize_m = squareSize(name).value_or(0);
                options.by = options.squareSize_m > 0 ? By::Square
                             : name == "file"         ? By::File
                             : name == "technology"   ? By::Technology
                             : name == "cell"         ? By::Cell
                                                      : By::Minute;
            },
            "Statistics for each file, technology, serving cell or minute of the clock, instead of all "
            "together; "
            "square:50m: for each square of the map with sides of 50 m")
        ->check(validator(
            [](const std::string& name) {
                return name == "file" || name == "technology" || name == "cell" || name == "minute" ||
                       squareSize(name);
            },
            "file or technology or cell or minute or square:50m"))
        ->type_name("file|technology|cell|minute|SQUARE");
    addMaximumGap(*command, options.maximumGap);
    addChoice(*command, options.selection, options.roles);
    addRange(*command, options.range, "Only what is reported at or after this time; what was before is known",
             "Only what is reported before this time");
    addClock(*command, options.clock);
    addTechnology(*command, options.technology, "Decode as");
    command->footer(
        "Percentiles are values that were reported (nearest rank). A state holds until the next report of "
        "it,\n"
        "and not across a silence of more than 30 s. The worst minute of serving.level and serving.quality "
        "has the\n"
        "lowest median, that of block-error-rate the highest mean, of the minutes with at least 5 samples. "
        "The\n"
        "json conforms to velmora-log-stats.schema.json.\n\n" +
        std::string(timeHelp) +
        "With several files that is the first message of all.\n\n"
        "Examples:\n"
        "  velmora-log stats drive.pcapng\n"
        "  velmora-log stats --role serving --histogram drive.pcapng\n"
        "  velmora-log stats --by cell --select '/GSM/GSM Serving Cell/RSSI' drive.pcapng\n"
        "  velmora-log stats --by square:50m --role serving.level --format csv drive.pcapng\n"
        "  velmora-log stats --by minute --format csv --role serving.level monday/*.pcapng > level.csv\n"
        "  velmora-log stats --format json drive.pcapng | jq '.roles[] | {role, p50, worstMinute}'");
    command->callback([&options] { checkTogether(options); });
    return command;
}

LeafChoice leafChoice(const NodeSelection& selection, const RoleSelection& roles) {
    LeafChoice choice;
    for (std::size_t i = 0; i < selection.paths().size(); ++i)
        choice.addPath(selection.names()[i], selection.paths()[i]);
    if (!roles.isEverything())
        for (const RoleName& name : roleNames())
            if (roles.contains(name.role))
                choice.addRole(name.role);
    return choice;
}

} // namespace velmora
