// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <map>
#include <set>
#include <string>
#include <vector>

namespace velmora {

/// A program's command line, parsed from its `--help`.
struct HelpText {
    std::set<std::string> options; ///< the long ones: "--format"
    std::set<std::string> commands;
    /// The values of those options that list them: "text", "json" of "--format text|json".
    std::map<std::string, std::set<std::string>> values;
    /// The kinds of `--source` and the options of each: "speed=", "loop" of "replay".
    std::map<std::string, std::set<std::string>> sources;
};

/// Runs the built program, or one of its commands, with `--help`.
[[nodiscard]] HelpText helpOf(const std::string& program, const std::string& command = {});

/// All matches of a regular expression's first group, line by line.
[[nodiscard]] std::vector<std::string> allMatches(const std::string& text, const std::string& expression);

} // namespace velmora
