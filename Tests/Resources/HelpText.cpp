// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Resources/HelpText.h"

#include "Tests/Support/ShellCommand.h"

#include <gtest/gtest.h>

#include <regex>
#include <sstream>

namespace velmora {

namespace {

/// The lines between a heading and the next empty line.
std::string part(const std::string& text, const std::string& heading) {
    const std::size_t begin = text.find("\n" + heading + ":\n");
    if (begin == std::string::npos)
        return {};
    const std::size_t from = begin + heading.size() + 3;
    return text.substr(from, text.find("\n\n", from) - from) + "\n";
}

std::set<std::string> split(const std::string& text, char separator) {
    std::istringstream in(text);
    std::set<std::string> pieces;
    for (std::string piece; std::getline(in, piece, separator);)
        pieces.insert(piece);
    return pieces;
}

} // namespace

std::vector<std::string> allMatches(const std::string& text, const std::string& expression) {
    const std::regex pattern(expression);
    std::vector<std::string> found;
    std::istringstream in(text);
    for (std::string line; std::getline(in, line);)
        for (std::sregex_iterator match(line.begin(), line.end(), pattern), end; match != end; ++match)
            found.push_back((*match)[1]);
    return found;
}

HelpText helpOf(const std::string& program, const std::string& command) {
    const ShellOutcome outcome =
        runShell(shellQuoted(std::string(VELMORA_BUILD_DIR "/") + program) + " " + command + " --help");
    EXPECT_EQ(outcome.status, 0) << program << " " << command;
    const std::string& text = outcome.output;
    HelpText help;
    const std::string options = part(text, "Options");
    for (const std::string& option : allMatches(options, "^  (?:-\\w,)?(--[a-z-]+)")) {
        help.options.insert(option);
        for (const std::string& values : allMatches(options, "^  " + option + " ([a-z]+(?:\\|[a-z]+)+)"))
            help.values[option] = split(values, '|');
    }
    // Either word may head them.
    for (const std::string& name :
         allMatches(part(text, "Commands") + part(text, "Subcommands"), "^  ([a-z]+)"))
        help.commands.insert(name);
    const std::string sources = part(text, "Sources");
    for (const std::string& form : allMatches(sources, "^  ([a-z]+(?::[A-Z]+)?(?:\\[[^\\]]*\\])*)")) {
        auto& source = help.sources[allMatches(form, "^([a-z]+)").at(0)];
        for (const std::string& option : allMatches(form, "\\[,([a-z]+=?)"))
            source.insert(option);
    }
    return help;
}

} // namespace velmora
