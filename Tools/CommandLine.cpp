// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/CommandLine.h"

#include "Platform/TelephonyService.h"
#include "Tools/Convert/Conversion.h"
#include "Tools/ExitStatus.h"
#include "Tools/Technologies.h"

#include <CLI/CLI.hpp>

#include <algorithm>
#include <cstdint>
#include <functional>
#include <optional>
#include <sstream>
#include <utility>
#include <vector>

namespace velmora {

namespace {

/// An option's check: what it wants is said when it is not what it gets.
CLI::Validator wants(std::function<bool(const std::string&)> isGood, const std::string& wanted) {
    return CLI::Validator(
        [isGood = std::move(isGood), wanted](const std::string& text) {
            return isGood(text) ? std::string() : "got " + text + ", wanted " + wanted;
        },
        "");
}

CLI::Validator wantsOneOf(const std::vector<std::string>& words) {
    std::string wanted;
    for (const std::string& word : words)
        wanted += (wanted.empty() ? "" : " or ") + word;
    return wants(
        [words](const std::string& text) {
            return std::find(words.begin(), words.end(), text) != words.end();
        },
        wanted);
}

CLI::Validator wantsCount() {
    return wants(
        [](const std::string& text) {
            std::uint64_t count = 0;
            return CLI::detail::lexical_cast(text, count) && count > 0;
        },
        "a number above 0");
}

/// No more than the event loop's timers hold, which is 24 days.
CLI::Validator wantsSeconds() {
    return wants(
        [](const std::string& text) {
            double seconds = 0;
            return CLI::detail::lexical_cast(text, seconds) && seconds >= 0.001 && seconds <= 2e6;
        },
        "seconds from 0.001 to 2000000");
}

CLI::Validator wantsLogLevel() {
    return wants([](const std::string& text) { return text.size() == 1 && text[0] >= '0' && text[0] <= '7'; },
                 "a number from 0 to 7");
}

void addBound(CLI::App& command, const std::string& name, std::optional<TimeBound>& bound,
              const std::string& description) {
    command
        .add_option_function<std::string>(
            name,
            [&bound](const std::string& text) {
                if (const Result<TimeBound> read = readTimeBound(text))
                    bound = *read;
            },
            description)
        ->check(CLI::Validator(
            [](const std::string& text) {
                const Result<TimeBound> read = readTimeBound(text);
                return read ? std::string() : read.reason();
            },
            ""))
        ->type_name("TIME");
}

/// Options that say nothing together.
void checkTogether(const DecodeOptions& options) {
    using Format = DecodeOptions::Format;
    const bool hasSelection = !options.selection.paths().empty();
    const bool everyMessage = options.every == DecodeOptions::Every::Message;
    if (options.format == Format::Csv && !hasSelection)
        throw CLI::ValidationError("--format csv", "got no --select, wanted one for each column");
    if (everyMessage && options.format != Format::JsonLines && options.format != Format::Csv)
        throw CLI::ValidationError("--every message", "got another format, wanted --format jsonl or csv");
    if (everyMessage && options.format == Format::JsonLines && hasSelection)
        throw CLI::ValidationError(
            "--every message", "got --select with --format jsonl, wanted it with --format csv or not at all");
}

CLI::App* addDecode(CLI::App& app, DecodeOptions& options) {
    CLI::App* command = app.add_subcommand("decode", "Show what recordings hold, as the screens would");
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
            "text, unless told otherwise: the display tree in the end; json: an object in the end, with the "
            "technology, the number of messages, and the display; jsonl: such an object with its time on a "
            "line of its own for each refresh; csv: a row for each refresh, a column for each --select")
        ->check(wantsOneOf({"text", "json", "jsonl", "csv"}))
        ->type_name("text|json|jsonl|csv");
    command
        ->add_option_function<std::string>(
            "--every",
            [&options](const std::string& what) {
                using Every = DecodeOptions::Every;
                options.every = what == "message" ? Every::Message : Every::Refresh;
            },
            "message: jsonl has an object for each message, with its code and what it concerned, and csv a "
            "row; refresh, unless told otherwise")
        ->check(wantsOneOf({"refresh", "message"}))
        ->type_name("refresh|message");
    command
        ->add_option_function<std::vector<std::string>>(
            "--select",
            [&options](const std::vector<std::string>& paths) { options.selection = NodeSelection(paths); },
            "Only this part of the display, by the names on the screens: \"/GSM/GSM Serving Cell/RSSI\", "
            "\"/GSM/Neighboring Cells/0\"; may be given several times")
        ->check(wants(NodeSelection::isPath, "a path that begins with a slash"))
        ->expected(1)
        ->allow_extra_args(false) // a FILE may follow
        ->multi_option_policy(CLI::MultiOptionPolicy::TakeAll)
        ->type_name("PATH");
    addBound(*command, "--from", options.range.from, "Only messages of this time and later");
    addBound(*command, "--to", options.range.to, "Only messages before this time");
    command
        ->add_option("--technology", options.technology,
                     "Decode as this technology, whatever the file says: " + technologyNames())
        ->type_name("NAME");
    command->add_option("--jobs", options.jobs, "Decode this many files side by side")
        ->check(wantsCount())
        ->type_name("N");
    command->footer(
        "With several files, text is headed by the files' names, json is one object a file, one behind\n"
        "the other, and jsonl and csv say in each line which \"file\" it is of. All JSON is laid out as\n"
        "velmora-log.schema.json says. A cell of csv without a value is empty.\n\n"
        "A TIME is ISO 8601 (UTC unless it has a zone), seconds since 1970, or +SECONDS after the file's\n"
        "first message.\n\n"
        "Examples:\n"
        "  velmora-log decode drive.pcapng\n"
        "  velmora-log decode --format json drive.pcapng | jq .display\n"
        "  velmora-log decode --format jsonl --every message --from +60 --to +120 drive.pcapng\n"
        "  velmora-log decode --format csv --select '/GSM/GSM Serving Cell/RSSI' drive.pcapng > rssi.csv\n"
        "  velmora-log decode --from 2026-11-16T05:00:00Z --select /GSM drive.pcapng\n"
        "  velmora-log decode --format jsonl --jobs 4 monday/*.pcapng > monday.jsonl\n"
        "  velmora-log decode --technology Ostrel_GSM - < drive.pcapng");
    return command;
}

CLI::App* addWatch(CLI::App& app, WatchOptions& options) {
    CLI::App* command = app.add_subcommand("watch", "Show what the telephony service reports, live");
    command->add_flag("--once", options.once, "Print the first refresh and end");
    command->footer(
        "On a terminal the screen is redrawn in place: arrows, j, k, PgUp, PgDn, Home and End scroll,\n"
        "q ends. On a pipe each refresh is printed in turn.\n\n"
        "Examples:\n"
        "  velmora-log watch\n"
        "  velmora-log watch --once | grep -A20 'Serving Cell'");
    return command;
}

CLI::App* addRecord(CLI::App& app, RecordOptions& options) {
    CLI::App* command =
        app.add_subcommand("record", "Record the telephony service's messages until interrupted");
    command->add_option("FILE", options.file, "Where to; - is standard output")->required()->type_name("");
    command->add_flag("--force", options.force, "Overwrite FILE where there is one");
    command
        ->add_option("--duration", options.duration_seconds, "Stop after this time, counted from the start")
        ->check(wantsSeconds())
        ->type_name("SECONDS");
    command->add_option("--count", options.count, "Stop after this many messages")
        ->check(wantsCount())
        ->type_name("N");
    command->footer(
        "What arrives is on its way to the disk within half a second. When FILE cannot be written or the\n"
        "service goes away, that is told at once; up to 32 MiB of messages wait, and recording goes on\n"
        "when it can. Messages that are missing in the end make the exit status 1.\n\n"
        "Examples:\n"
        "  velmora-log record drive.pcapng\n"
        "  velmora-log record --duration 600 --force drive.pcapng\n"
        "  velmora-log record - | velmora-log info -");
    return command;
}

CLI::App* addConvert(CLI::App& app, ConvertOptions& options) {
    CLI::App* command =
        app.add_subcommand("convert", "Make another form of a recording, snapshot or DLF log");
    command->add_option("FILE", options.file, "What to convert; - is standard input")
        ->required()
        ->type_name("");
    command
        ->add_option(
            "OUT", options.out,
            "What it becomes, by its suffix: .pcapng a recording, .velmora a snapshot, .dlf a DLF log")
        ->required()
        ->check(wants([](const std::string& name) { return formFromName(name).has_value(); },
                      std::string("a name that ends in ") + formSuffixes))
        ->type_name("");
    command->add_flag("--force", options.force, "Overwrite OUT where there is one");
    command
        ->add_option("--technology", options.technology,
                     "Convert as this technology, whatever the file says: " + technologyNames())
        ->type_name("NAME");
    command
        ->add_option("--description", options.description,
                     "What a snapshot says of itself; nothing, unless told otherwise")
        ->type_name("TEXT");
    command->footer(
        "A recording holds all messages with their times, a DLF log all messages; a snapshot is the one\n"
        "that the application would have written in the end: the last five displays with the messages\n"
        "behind them. OUT is there when it is whole, or not at all. What is lost of FILE is told, makes\n"
        "the exit status 1, and does not keep the rest from being converted.\n\n"
        "Examples:\n"
        "  velmora-log convert drive.pcapng drive.velmora --description 'gate 4, roof'\n"
        "  velmora-log convert --technology Ostrel_LTE modem.dlf modem.pcapng\n"
        "  velmora-log record - | velmora-log convert - drive.dlf");
    return command;
}

CLI::App* addInfo(CLI::App& app, InfoOptions& options) {
    CLI::App* command = app.add_subcommand("info", "Tell what a recording holds: times, log codes, damage");
    command->add_option("FILE", options.file, "A recording, snapshot or DLF log; - is standard input")
        ->required()
        ->type_name("");
    command
        ->add_option("--technology", options.technology,
                     "Name the log codes of this technology, whatever the file says: " + technologyNames())
        ->type_name("NAME");
    command->footer("Examples:\n"
                    "  velmora-log info drive.pcapng\n"
                    "  velmora-log info --technology Ostrel_LTE modem.dlf");
    return command;
}

std::string whatIsWrong(const CLI::App& app, const CLI::ParseError& error) {
    if (!app.get_subcommands().empty())
        return error.what();
    const std::vector<std::string> rest = app.remaining();
    if (rest.empty())
        return "no command, wanted decode, watch, record, convert or info";
    return "got " + rest.front() + ", wanted one of the commands decode, watch, record, convert and info";
}

} // namespace

CommandLine parseCommandLine(int count, const char* const* arguments) {
    CommandLine line;
    CLI::App app("Works with the cellular modem's log messages: live ones, and recordings of them.",
                 "velmora-log");
    app.set_version_flag("--version", "velmora-log " VELMORA_VERSION);
    app.require_subcommand(1);
    app.get_formatter()->label("SUBCOMMAND", "COMMAND");
    app.get_formatter()->label("Subcommands", "Commands");
    // The options below are taken after the command's name as well.
    app.fallthrough();
    app.add_option_function<std::string>(
           "--log",
           [&line](const std::string& name) { line.log = logKindNamed(name).value_or(LogKind::Stderr); },
           "Where log lines go, stderr unless told otherwise")
        ->check(wantsOneOf({"syslog", "stderr"}))
        ->type_name("syslog|stderr");
    app.add_option("--log-level", line.logLevel,
                   "The least urgent log lines that are written, 0 to 7; 3 unless told otherwise")
        ->check(wantsLogLevel())
        ->type_name("N");
    app.footer("Exit status: 0 done, 1 the input was bad, 2 usage.\n\n"
               "Examples:\n"
               "  velmora-log watch\n"
               "  velmora-log record drive.pcapng\n"
               "  velmora-log decode drive.pcapng\n"
               "  velmora-log COMMAND --help");

    DecodeOptions decode;
    WatchOptions watch;
    RecordOptions record;
    ConvertOptions convert;
    InfoOptions info;
    const CLI::App* decodeCommand = addDecode(app, decode);
    const CLI::App* watchCommand = addWatch(app, watch);
    const CLI::App* recordCommand = addRecord(app, record);
    const CLI::App* convertCommand = addConvert(app, convert);
    addInfo(app, info);

    try {
        app.parse(count, arguments);
        checkTogether(decode);
    } catch (const CLI::ParseError& error) {
        std::ostringstream out;
        std::ostringstream ignored;
        if (app.exit(error, out, ignored) == 0)
            line.command = CommandLine::Words{ExitStatus::Done, out.str()};
        else
            line.command = CommandLine::Words{ExitStatus::Usage, "velmora-log: " + whatIsWrong(app, error) +
                                                                     "\nvelmora-log --help tells more\n"};
        return line;
    }
    if (decodeCommand->parsed())
        line.command = decode;
    else if (watchCommand->parsed())
        line.command = watch;
    else if (recordCommand->parsed())
        line.command = record;
    else if (convertCommand->parsed())
        line.command = convert;
    else
        line.command = info;
    return line;
}

} // namespace velmora
