// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Messages/SelectionOptions.h"

#include "Tools/CommandOptions.h"
#include "Tools/Messages/LogCodeText.h"

#include <optional>
#include <vector>

namespace velmora {

namespace {

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

} // namespace

void addRange(CLI::App& command, TimeRange& range, const std::string& from, const std::string& to) {
    addBound(command, "--from", range.from, from);
    addBound(command, "--to", range.to, to);
}

void addSelection(CLI::App& command, MessageSelection& selection, const std::string& cold) {
    addRange(command, selection.range, "Only messages at or after this time" + cold,
             "Only messages before this time");
    command
        .add_option_function<std::vector<std::string>>(
            "--code",
            [&selection](const std::vector<std::string>& texts) {
                for (const std::string& text : texts)
                    if (const Result<std::uint32_t> code = readLogCode(text))
                        selection.codes.push_back(*code);
            },
            "Only messages of this log code, as info lists it (0x512C)" + cold + "; may be repeated")
        ->check(CLI::Validator(
            [](const std::string& text) {
                const Result<std::uint32_t> code = readLogCode(text);
                return code ? std::string() : code.reason();
            },
            ""))
        ->expected(1)
        ->allow_extra_args(false) // a FILE may follow
        ->multi_option_policy(CLI::MultiOptionPolicy::TakeAll)
        ->type_name("CODE");
}

} // namespace velmora
