// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/DecodeOptions.h"

#include "Tools/CommandOptions.h"
#include "Tools/Messages/PositionOptions.h"
#include "Tools/Messages/SelectionOptions.h"

namespace velmora {

namespace {

/// A process each: far more than any machine has processors.
constexpr std::uint64_t maximumJobs = 1000;

/// Refuses options that make no sense together.
void checkTogether(const DecodeOptions& options) {
    using Format = DecodeOptions::Format;
    const bool hasSelection = !options.selection.paths().empty();
    const bool everyMessage = options.every == DecodeOptions::Every::Message;
    if (options.messages.isWarm && !options.messages.range.from)
        throw CLI::ValidationError("--warm", "got no --from, wanted the time from which on to write");
    if (options.maximumAge && (everyMessage || options.samples != DecodeOptions::Samples::None ||
                               (options.format != Format::JsonLines && options.format != Format::Csv)))
        throw CLI::ValidationError("--max-age",
                                   "got another output, wanted --every refresh with --format jsonl "
                                   "or csv");
    checkSafe(options.guard, options.format == Format::Csv);
    if (options.samples != DecodeOptions::Samples::None) {
        const bool isWide = options.samples == DecodeOptions::Samples::Wide;
        if (isWide && options.format != Format::Csv)
            throw CLI::ValidationError("--wide", "got another format, wanted --format csv");
        if (isWide && !hasSelection)
            throw CLI::ValidationError("--wide", "got no --select, wanted one for each column");
        if (options.format != Format::JsonLines && options.format != Format::Csv)
            throw CLI::ValidationError("--samples", "got another format, wanted --format jsonl or csv");
        if (everyMessage)
            throw CLI::ValidationError("--samples", "got --every message too, wanted one of the two");
        return;
    }
    if (options.format == Format::Csv && !hasSelection)
        throw CLI::ValidationError("--format csv", "got no --select, wanted one for each column");
    if (everyMessage && options.format != Format::JsonLines && options.format != Format::Csv)
        throw CLI::ValidationError("--every message", "got another format, wanted --format jsonl or csv");
}

} // namespace

CLI::App* addDecode(CLI::App& app, DecodeOptions& options) {
    CLI::App* command = app.add_subcommand("decode", "Decode recordings and print their display");
    command->add_option("FILE", options.files, "Recordings; - is standard input")->required()->type_name("");
    command
        ->add_option_function<std::string>(
            "--format",
            [&options](const std::string& name) {
                using Format = DecodeOptions::Format;
                options.format = name == "json"    ? Format::Json
                                 : name == "jsonl" ? Format::JsonLines
                                 : name == "csv"   ? Format::Csv
                                                   : Format::Text;
            },
            "text (the default): the final display as a tree; json: one object with the technology, "
            "the number of messages and the final display; jsonl: such an object with its time for each "
            "refresh, one a line; csv: a row for each refresh, a column for each --select")
        ->check(oneOf({"text", "json", "jsonl", "csv"}))
        ->type_name("text|json|jsonl|csv");
    command
        ->add_option_function<std::string>(
            "--every",
            [&options](const std::string& what) {
                using Every = DecodeOptions::Every;
                options.every = what == "message" ? Every::Message : Every::Refresh;
            },
            "message: jsonl has an object for each message, with its code and what it changed, and csv a "
            "row; the default is refresh")
        ->check(oneOf({"refresh", "message"}))
        ->type_name("refresh|message");
    using Samples = DecodeOptions::Samples;
    CLI::Option* const samples = command->add_flag_callback(
        "--samples",
        [&options] { options.samples = options.samples == Samples::Wide ? Samples::Wide : Samples::Long; },
        "jsonl and csv have a line for each value that a message reported, in the catalogue's unit and sign "
        "(velmora-log fields), instead of the display");
    command
        ->add_flag_callback(
            "--wide", [&options] { options.samples = Samples::Wide; },
            "With --samples and csv: a row for each message that reported a selected value, a column for "
            "each selected leaf, a row of its own for each row of a list")
        ->needs(samples);
    CLI::Option* const positions =
        command->add_flag("--positions", options.hasPositions,
                          "With --samples: latitude, longitude, altitude, speed, age of the fix, HDOP and "
                          "standard deviation at "
                          "each message's time, empty where the recording has no position then");
    positions->needs(samples);
    addMaximumGap(*command, options.maximumGap)->needs(positions);
    addSafe(*command, options.guard);
    command
        ->add_option_function<double>(
            "--max-age",
            [&options](double seconds) {
                options.maximumAge = std::chrono::duration_cast<std::chrono::nanoseconds>(
                    std::chrono::duration<double>(seconds));
            },
            "At each refresh, leave out values that were reported longer ago: a display keeps what it shows "
            "until something else replaces it")
        ->check(positiveSeconds())
        ->type_name("SECONDS");
    command
        ->add_option_function<std::vector<std::string>>(
            "--select",
            [&options](const std::vector<std::string>& paths) { options.selection = NodeSelection(paths); },
            "Only this part of the display, by a path of the names on the screens: "
            "\"/GSM/GSM Serving Cell/RSSI\", \"/GSM/Neighboring Cells/0\"; a * is any name or row, as in "
            "\"/GSM/Neighboring Cells/*/RSSI\", and \"level=/GSM/GSM Serving Cell/RSSI\" names a column; may "
            "be repeated")
        ->check(validator(NodeSelection::isPath, "a path that begins with a slash"))
        ->expected(1)
        ->allow_extra_args(false) // a FILE may follow
        ->multi_option_policy(CLI::MultiOptionPolicy::TakeAll)
        ->type_name("PATH");
    addSelection(*command, options.messages,
                 "; decoding starts cold: what the others leave in the display is missing");
    command->add_flag("--warm", options.messages.isWarm,
                      "With --from: decode from the beginning, and write from that time on what decoding "
                      "without --from would write");
    addTechnology(*command, options.technology, "Decode as");
    addMaskOption(*command, options.mask);
    command->add_flag("--strict", options.isStrict,
                      "End at a message that ends the application; by default it is counted, reported and "
                      "left out");
    command
        ->add_option("--jobs", options.jobs,
                     "Decode this many files in parallel, at most 1000; by default, as many as there are "
                     "processors, and 1 where files are small or several are pipes")
        ->check(countUpTo(maximumJobs))
        ->type_name("N");
    command->footer(
        "With several files, text has the files' names as headings, json is one object after another,\n"
        "and jsonl and csv have the \"file\" in each line. All JSON conforms to velmora-log.schema.json.\n"
        "A csv cell without a value is empty.\n\n"
        "Of a file of several technologies each is decoded by itself: text and json have one display after\n"
        "the other, and each line of jsonl and csv names its technology.\n\n" +
        std::string(timeHelp) + "\n" + maskHelp +
        "\nExamples:\n"
        "  velmora-log decode drive.pcapng\n"
        "  velmora-log decode --format json drive.pcapng | jq .display\n"
        "  velmora-log decode --format jsonl --every message --from +60 --to +120 drive.pcapng\n"
        "  velmora-log decode --format csv --select '/GSM/GSM Serving Cell/RSSI' drive.pcapng > rssi.csv\n"
        "  velmora-log decode --samples --format csv --select 'level=/GSM/GSM Serving Cell/RSSI' "
        "drive.pcapng\n"
        "  velmora-log decode --samples --format jsonl --select '/GSM/Neighboring Cells/*/RSSI' "
        "drive.pcapng\n"
        "  velmora-log decode --samples --positions --format csv --select 'level=/GSM/GSM Serving Cell/RSSI' "
        "drive.pcapng\n"
        "  velmora-log decode --max-age 5 --format csv --select '/GSM/GSM Serving Cell/RSSI' drive.pcapng\n"
        "  velmora-log decode --warm --from 2026-11-16T05:00:00Z --format jsonl drive.pcapng\n"
        "  velmora-log decode --from 2026-11-16T05:00:00Z --select /GSM drive.pcapng\n"
        "  velmora-log decode --mask drive.pcapng\n"
        "  velmora-log decode --format jsonl --jobs 4 monday/*.pcapng > monday.jsonl\n"
        "  velmora-log decode --technology Ostrel_GSM - < drive.pcapng");
    command->callback([&options] { checkTogether(options); });
    return command;
}

} // namespace velmora
