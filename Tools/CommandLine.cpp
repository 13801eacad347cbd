#include "Tools/CommandLine.h"

#include "Tools/ExitStatus.h"
#include "Tools/Technologies.h"

#include <CLI/CLI.hpp>

#include <algorithm>
#include <cstdint>
#include <functional>
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

CLI::App* addDecode(CLI::App& app, DecodeOptions& options) {
    CLI::App* command = app.add_subcommand("decode", "Show what recordings hold, as the screens would");
    command->add_option("FILE", options.files, "Recordings; - is standard input")->required()->type_name("");
    command
        ->add_option_function<std::string>(
            "--format",
            [&options](const std::string& name) {
                options.format = name == "json" ? DecodeOptions::Format::Json : DecodeOptions::Format::Text;
            },
            "text, unless told otherwise: the display tree; json: an object with the technology, the "
            "number of messages, and the display")
        ->check(wantsOneOf({"text", "json"}))
        ->type_name("text|json");
    command
        ->add_option("--technology", options.technology,
                     "Decode as this technology, whatever the file says: " + technologyNames())
        ->type_name("NAME");
    command->footer(
        "With several files, text is headed by the files' names and json is one object a file, one\n"
        "behind the other.\n\n"
        "Examples:\n"
        "  velmora-log decode drive.pcapng\n"
        "  velmora-log decode --format json drive.pcapng | jq .display\n"
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
    command->footer("Examples:\n"
                    "  velmora-log record drive.pcapng\n"
                    "  velmora-log record --duration 600 --force drive.pcapng\n"
                    "  velmora-log record - | velmora-log info -");
    return command;
}

CLI::App* addInfo(CLI::App& app, InfoOptions& options) {
    CLI::App* command = app.add_subcommand("info", "Tell what a recording holds: times, log codes, damage");
    command->add_option("FILE", options.file, "A recording; - is standard input")->required()->type_name("");
    command->footer("Example:\n"
                    "  velmora-log info drive.pcapng");
    return command;
}

std::string whatIsWrong(const CLI::App& app, const CLI::ParseError& error) {
    if (!app.get_subcommands().empty())
        return error.what();
    const std::vector<std::string> rest = app.remaining();
    if (rest.empty())
        return "no command, wanted decode, watch, record or info";
    return "got " + rest.front() + ", wanted one of the commands decode, watch, record and info";
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
    InfoOptions info;
    const CLI::App* decodeCommand = addDecode(app, decode);
    const CLI::App* watchCommand = addWatch(app, watch);
    const CLI::App* recordCommand = addRecord(app, record);
    addInfo(app, info);

    try {
        app.parse(count, arguments);
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
    else
        line.command = info;
    return line;
}

} // namespace velmora
