// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/EventsOptions.h"

#include "Tools/CommandOptions.h"
#include "Tools/Events/Programs/CommandText.h"
#include "Tools/Messages/PositionOptions.h"
#include "Tools/Messages/SelectionOptions.h"
#include "Tools/Stats/ChoiceOptions.h"

#include <sstream>

namespace velmora {

namespace {

/// As `record` has it.
constexpr std::uint64_t maximumCount = 1'000'000'000'000;

void checkTogether(const EventsOptions& options) {
    using Format = EventsOptions::Format;
    checkSafe(options.guard, options.format == Format::Csv);
    if (options.hasEvidence && options.format != Format::Text)
        throw CLI::ValidationError("--records", "got another format, wanted --format text: the others have "
                                                "them");
    if (options.hasPositions && options.format != Format::Text)
        throw CLI::ValidationError("--positions", "got another format, wanted --format text: the others have "
                                                  "them");
    if (options.hasPositions && options.clock != AnalysisClock::Arrival)
        throw CLI::ValidationError("--positions",
                                   "got --clock modem, wanted --clock arrival, by which positions are "
                                   "known");
    if (options.files.empty()) {
        if (options.hasPositions)
            throw CLI::ValidationError("--positions",
                                       "got no FILE, wanted one: the telephony service has none");
        if (!options.technology.empty())
            throw CLI::ValidationError("--technology", "got no FILE, wanted one: the telephony service names "
                                                       "its technology");
        return;
    }
    const auto refuse = [](bool isGiven, const char* name) {
        if (isGiven)
            throw CLI::ValidationError(name, "got a FILE too, wanted one of the two");
    };
    refuse(options.duration_seconds.has_value(), "--duration");
    refuse(options.count.has_value(), "--count");
    refuse(options.timeout_seconds.has_value(), "--timeout");
}

std::vector<std::string> partsOf(const std::string& list) {
    std::vector<std::string> parts;
    std::istringstream in(list);
    for (std::string part; std::getline(in, part, ',');)
        if (!part.empty())
            parts.push_back(part);
    return parts;
}

void addSeverity(CLI::App& command, const std::string& name, const std::string& description,
                 std::function<void(Severity)> set) {
    command
        .add_option_function<std::string>(
            name, [set = std::move(set)](const std::string& text) { set(*severityNamed(text)); }, description)
        ->check(oneOf({"info", "warning", "critical"}))
        ->type_name("info|warning|critical");
}

void addListed(CLI::App& command, EventsOptions& options) {
    command
        .add_option_function<std::vector<std::string>>(
            "--kind",
            [&options](const std::vector<std::string>& lists) {
                for (const std::string& list : lists)
                    for (std::string& kind : partsOf(list))
                        options.selection.kinds.push_back(std::move(kind));
            },
            "Only events of this kind, or of these, separated by commas; may be repeated")
        ->expected(1)
        ->allow_extra_args(false) // a FILE may follow
        ->multi_option_policy(CLI::MultiOptionPolicy::TakeAll)
        ->type_name("KIND");
    addSeverity(command, "--severity", "Only events of at least this severity",
                [&options](Severity severity) { options.selection.least = severity; });
    addRange(command, options.selection.range,
             "Only events that happen at or after this time, or last until then; what was before is known",
             "Only events that happen or begin before this time");
}

void addFormat(CLI::App& command, EventsOptions& options) {
    command
        .add_option_function<std::string>(
            "--format",
            [&options](const std::string& name) {
                using Format = EventsOptions::Format;
                options.format = name == "jsonl" ? Format::JsonLines
                                 : name == "csv" ? Format::Csv
                                                 : Format::Text;
            },
            "text (the default): a line each, in columns; jsonl: an object each, with all that is known; "
            "csv: a row each")
        ->check(oneOf({"text", "jsonl", "csv"}))
        ->type_name("text|jsonl|csv");
    addSafe(command, options.guard);
    command.add_flag("--records", options.hasEvidence,
                     "With text: at the end of each line the numbers of the records that made the event");
    command.add_flag("--positions", options.hasPositions,
                     "With text: where the receiver was when the event happened or began, of recordings with "
                     "positions; csv and jsonl have it anyway");
    addMaximumGap(command, options.maximumGap);
    command.add_flag("--live", options.isLive,
                     "Write each event as soon as it is known, one that lasts at its begin too, as without a "
                     "FILE: for a pipe; by default events are sorted by their begin");
    addClock(command, options.clock);
    addTechnology(command, options.technology, "Analyse as");
    addMaskOption(command, options.mask);
}

void addPrograms(CLI::App& command, EventsOptions& options) {
    CLI::Option* const exec =
        command
            .add_option_function<std::string>(
                "--exec",
                [&options](const std::string& text) {
                    if (Result<std::vector<std::string>> words = splitCommand(text))
                        options.program = *std::move(words);
                },
                "Run this program for each event that is listed, with the event in its environment "
                "(VELMORA_EVENT_KIND, ...); blanks separate its arguments, quotes and backslashes keep them, "
                "and nothing else is special: there is no shell")
            ->check(CLI::Validator(
                [](const std::string& text) {
                    const auto words = splitCommand(text);
                    return words ? std::string() : words.reason();
                },
                ""))
            ->type_name("COMMAND");
    command
        .add_option("--exec-timeout", options.programLimit_seconds,
                    "End a program and its children after this time; the default is 10")
        ->needs(exec)
        ->check(positiveSeconds())
        ->type_name("SECONDS");
    addSeverity(command, "--fail-on", "Exit with status 3 if an event of at least this severity is listed",
                [&options](Severity severity) { options.failOn = severity; });
}

void addRules(CLI::App& command, EventsOptions& options) {
    command
        .add_option("--rules", options.rules,
                    "Also find the events of the rules in this file; may be repeated")
        ->expected(1)
        ->allow_extra_args(false)
        ->multi_option_policy(CLI::MultiOptionPolicy::TakeAll)
        ->type_name("RULES");
    command.add_flag_callback(
        "--no-rules", [&options] { options.usesStandardRules = false; },
        "Leave out the built-in rules and those in ~/.config/velmora/rules");
}

void addService(CLI::App& command, EventsOptions& options) {
    command
        .add_option("--duration", options.duration_seconds, "Without a FILE: stop this long after the start")
        ->check(positiveSeconds())
        ->type_name("SECONDS");
    command.add_option("--count", options.count, "Without a FILE: stop after this many messages")
        ->check(countUpTo(maximumCount))
        ->type_name("N");
    command
        .add_option("--timeout", options.timeout_seconds,
                    "Without a FILE: end with status 1 if no telephony service has answered after this time; "
                    "the default is to wait")
        ->check(positiveSeconds())
        ->type_name("SECONDS");
}

} // namespace

CLI::App* addEvents(CLI::App& app, EventsOptions& options) {
    CLI::App* command = app.add_subcommand(
        "events", "List what happened in recordings, or what happens now: handovers, lost coverage, ...");
    command
        ->add_option("FILE", options.files,
                     "Recordings that follow each other; - is standard input; none for the telephony service")
        ->type_name("");
    addFormat(*command, options);
    addListed(*command, options);
    addRules(*command, options);
    addPrograms(*command, options);
    addService(*command, options);
    command->footer(
        "The files follow each other: what one leaves is known in the next. The events are those of\n"
        "Documentation/events.md and of rules. The jsonl conforms to velmora-log-events.schema.json.\n\n"
        "--exec runs at most one program at a time for events of a kind. With FILE the next event of that\n"
        "kind waits for it; live it has no program, and how many had none is reported.\n\n" +
        std::string(timeHelp) + "With several files that is the first message of all.\n\n" + maskHelp +
        "\n"
        "Examples:\n"
        "  velmora-log events gsm.pcapng lte.pcapng\n"
        "  velmora-log events --severity warning --from +3600 drive.pcapng\n"
        "  velmora-log events --kind handover,cell-reselection --format jsonl drive.pcapng | jq .fields.to\n"
        "  velmora-log events --mask=location drive.pcapng\n"
        "  velmora-log events --rules my.toml --fail-on warning drive.pcapng; echo $?\n"
        "  velmora-log events --severity critical --exec 'notify-send Velmora'");
    command->callback([&options] { checkTogether(options); });
    return command;
}

} // namespace velmora
