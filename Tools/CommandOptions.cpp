// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/CommandOptions.h"

#include "Tools/Technologies.h"

#include <algorithm>
#include <charconv>
#include <cstdint>
#include <system_error>
#include <utility>

namespace velmora {

CLI::Validator validator(std::function<bool(const std::string&)> isValid, const std::string& expected) {
    return CLI::Validator(
        [isValid = std::move(isValid), expected](const std::string& text) {
            return isValid(text) ? std::string() : "got " + text + ", wanted " + expected;
        },
        "");
}

CLI::Validator oneOf(const std::vector<std::string>& words) {
    std::string expected;
    for (const std::string& word : words)
        expected += (expected.empty() ? "" : " or ") + word;
    return validator(
        [words](const std::string& text) {
            return std::find(words.begin(), words.end(), text) != words.end();
        },
        expected);
}

CLI::Validator countUpTo(std::uint64_t most) {
    return validator(
        [most](const std::string& text) {
            // The library's conversion wraps negative numbers around, clamps large ones and knows other
            // bases.
            std::uint64_t count = 0;
            const char* const end = text.data() + text.size();
            const std::from_chars_result read = std::from_chars(text.data(), end, count);
            return read.ec == std::errc() && read.ptr == end && text.front() != '0' && count <= most;
        },
        "a number from 1 to " + std::to_string(most));
}

CLI::Validator positiveSeconds() {
    return validator(
        [](const std::string& text) {
            double seconds = 0;
            return CLI::detail::lexical_cast(text, seconds) && seconds >= 0.001 && seconds <= 2e6;
        },
        "seconds from 0.001 to 2000000");
}

void addTechnology(CLI::App& command, std::string& technology, const std::string& purpose) {
    addTechnologyOption(command, technology,
                        purpose +
                            " this technology, overriding the file's; of a file of several technologies, "
                            "this one alone");
}

void addTechnologyOption(CLI::App& command, std::string& technology, const std::string& description) {
    command
        .add_option_function<std::string>(
            "--technology",
            [&technology](const std::string& text) { technology = technologyMeantBy(text).value_or(text); },
            description + ": " + technologyForms())
        ->check(validator([](const std::string& text) { return technologyMeantBy(text).has_value(); },
                          "one of " + technologyForms()))
        ->type_name("NAME");
}

void addSafe(CLI::App& command, CSVGuard& guard) {
    command.add_flag_callback(
        "--safe", [&guard] { guard = CSVGuard::On; },
        "With csv: put an apostrophe before texts that begin with =, +, -, @ or a control character and are "
        "no "
        "number, which spreadsheets would calculate");
}

void checkSafe(CSVGuard guard, bool isCSV) {
    if (guard == CSVGuard::On && !isCSV)
        throw CLI::ValidationError("--safe", "got another format, wanted --format csv");
}

} // namespace velmora
