// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/CommandLine.h"

#include "Platform/PrintableText.h"
#include "Tools/CommandOptions.h"
#include "Tools/ExitStatus.h"

#include <cstddef>
#include <functional>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

namespace velmora {

namespace {

CLI::Validator validLogLevel() {
    return validator(
        [](const std::string& text) { return text.size() == 1 && text[0] >= '0' && text[0] <= '7'; },
        "a number from 0 to 7");
}

/// The names of all commands, the last one after that word: "decode, watch and record".
std::string commandNames(const CLI::App& app, const std::string& lastWord) {
    const std::vector<const CLI::App*> commands = app.get_subcommands([](const CLI::App*) { return true; });
    std::string names;
    for (std::size_t i = 0; i < commands.size(); ++i) {
        if (i > 0)
            names += i + 1 < commands.size() ? ", " : ' ' + lastWord + ' ';
        names += commands[i]->get_name();
    }
    return names;
}

std::string usageError(const CLI::App& app, const CLI::ParseError& error) {
    if (!app.get_subcommands().empty())
        return error.what();
    const std::vector<std::string> rest = app.remaining();
    if (rest.empty())
        return "no command, wanted " + commandNames(app, "or");
    return "got " + rest.front() + ", wanted one of the commands " + commandNames(app, "and");
}

/// The commands, with the options that parsing fills.
class Commands {
public:
    template <class Options>
    void add(CLI::App& app, CLI::App* (*addCommand)(CLI::App&, Options&)) {
        const auto options = std::make_shared<Options>();
        const CLI::App* const command = addCommand(app, *options);
        _choices.emplace_back([command, options](CommandLine& line) {
            if (command->parsed())
                line.command = *options;
        });
    }
    /// Puts the options of the command that was named into the line.
    void choose(CommandLine& line) const {
        for (const auto& each : _choices)
            each(line);
    }

private:
    std::vector<std::function<void(CommandLine&)>> _choices;
};

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
    app.footer("Exit status: 0 done, 1 the input was bad, 2 usage, 3 see events --fail-on.\n\n"
               "Examples:\n"
               "  velmora-log watch\n"
               "  velmora-log record drive.pcapng\n"
               "  velmora-log decode drive.pcapng\n"
               "  velmora-log COMMAND --help");

    Commands commands;
    commands.add(app, addDecode);
    commands.add(app, addBrowse);
    commands.add(app, addWatch);
    commands.add(app, addRecord);
    commands.add(app, addConvert);
    commands.add(app, addInfo);
    commands.add(app, addFields);
    commands.add(app, addEvents);
    commands.add(app, addRules);
    commands.add(app, addStats);
    commands.add(app, addDiff);
    commands.add(app, addReport);
    commands.add(app, addMask);
    commands.add(app, addColumns);

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
    commands.choose(line);
    return line;
}

} // namespace velmora
