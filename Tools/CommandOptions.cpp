// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/CommandOptions.h"

#include "Platform/TelephonyService.h"

#include <algorithm>
#include <cstdint>
#include <utility>

namespace velmora {

CLI::Validator wants(std::function<bool(const std::string&)> isGood, const std::string& wanted) {
    return CLI::Validator(
        [isGood = std::move(isGood), wanted](const std::string& text) {
            return isGood(text) ? std::string() : "got " + text + ", wanted " + wanted;
        },
        "");
}

CLI::Validator oneOf(const std::vector<std::string>& words) {
    std::string wanted;
    for (const std::string& word : words)
        wanted += (wanted.empty() ? "" : " or ") + word;
    return wants(
        [words](const std::string& text) {
            return std::find(words.begin(), words.end(), text) != words.end();
        },
        wanted);
}

CLI::Validator positiveCount() {
    return wants(
        [](const std::string& text) {
            std::uint64_t count = 0;
            return CLI::detail::lexical_cast(text, count) && count > 0;
        },
        "a number above 0");
}

void addTechnology(CLI::App& command, std::string& technology, const std::string& purpose) {
    command
        .add_option("--technology", technology,
                    purpose + " this technology, overriding the file's: " + technologyNames())
        ->type_name("NAME");
}

} // namespace velmora
