// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/CommandLine.h"

#include "Platform/PrintableText.h"
#include "Tools/CommandOptions.h"
#include "Tools/ExitStatus.h"

#include <sstream>
#include <vector>

namespace velmora {

namespace {

CLI::Validator validLogLevel() {
    return validator(
        [](const std::string& text) { return text.size() == 1 && text[0] >= '0' && text[0] <= '7'; },
        "a number from 0 to 7");
}

std::string usageError(const CLI::App& app, const CLI::ParseError& error) {
    if (!app.get_subcommands().empty())
        return error.what();
    const std::vector<std::string> rest = app.remaining();
    if (rest.empty())
        return "no command, wanted decode, watch, record, convert, info, fields or columns";
    return "got " + rest.front() +
           ", wanted one of the commands decode, watch, record, convert, info, fields and "
           "columns";
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
           "Where log lines go; the default is stderr")
        ->check(oneOf({"syslog", "stderr"}))
        ->type_name("syslog|stderr");
    app.add_option("--log-level", line.logLevel,
                   "The least urgent log lines that are written, 0 to 7; the default is 3")
        ->check(validLogLevel())
        ->type_name("N");
    app.add_flag("-v,--verbose", line.verbose,
                 "Write each log line of a decoder as it arises, not their sum at the end, and those that "
                 "report its start and end");
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
    FieldsOptions fields;
    ColumnsOptions columns;
    const CLI::App* decodeCommand = addDecode(app, decode);
    const CLI::App* watchCommand = addWatch(app, watch);
    const CLI::App* recordCommand = addRecord(app, record);
    const CLI::App* convertCommand = addConvert(app, convert);
    const CLI::App* infoCommand = addInfo(app, info);
    const CLI::App* fieldsCommand = addFields(app, fields);
    addColumns(app, columns);

    try {
        app.parse(count, arguments);
    } catch (const CLI::ParseError& error) {
        std::ostringstream out;
        std::ostringstream ignored;
        if (app.exit(error, out, ignored) == 0)
            line.command = CommandLine::Notice{ExitStatus::Done, out.str()};
        else
            line.command = CommandLine::Notice{ExitStatus::Usage,
                                               "velmora-log: " + printableLine(usageError(app, error)) +
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
    else if (infoCommand->parsed())
        line.command = info;
    else if (fieldsCommand->parsed())
        line.command = fields;
    else
        line.command = columns;
    return line;
}

} // namespace velmora
