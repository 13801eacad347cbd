// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Log/LineText.h"

#include <algorithm>
#include <charconv>
#include <cstdio>
#include <initializer_list>

namespace velmora {

namespace {

bool isDigit(char character) {
    return character >= '0' && character <= '9';
}

/// Takes the prefix off the text; false where the text begins otherwise.
bool skip(std::string_view& text, std::string_view prefix) {
    if (!text.starts_with(prefix))
        return false;
    text.remove_prefix(prefix.size());
    return true;
}

/// Takes a number off the text.
std::optional<std::uint32_t> takeNumber(std::string_view& text, int base) {
    std::uint32_t number = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number, base);
    if (error != std::errc())
        return std::nullopt;
    text.remove_prefix(static_cast<std::size_t>(end - text.data()));
    return number;
}

} // namespace

std::string LineText::subject() const {
    if (!code)
        return {};
    char text[24];
    std::snprintf(text, sizeof text, *code > 0xFFFF ? " of 0x%06X" : " of 0x%04X",
                  static_cast<unsigned>(*code));
    return text;
}

LineText parseLine(std::string_view text) {
    std::string_view rest = text;
    if (skip(rest, "Received an unknown log message: ")) {
        const std::optional<std::uint32_t> code = takeNumber(rest, 10);
        if (code && rest.empty())
            return {code, "unknown log message"};
    }
    rest = text;
    if (skip(rest, "Record 0x") || skip(rest, "Log code 0x")) {
        const std::optional<std::uint32_t> code = takeNumber(rest, 16);
        if (code && (skip(rest, ": ") || skip(rest, " "))) {
            static_cast<void>(skip(rest, "is "));
            return {code, rest};
        }
    }
    return {std::nullopt, text};
}

bool isLifecycleLine(std::string_view text) {
    const std::initializer_list<std::string_view> beginnings = {
        "Creating ",
        "Created ",
        "Class Index: ",
        "Initialized class index: ",
        " ***** Created ports ",
        "Got log generated: 0x",
        "Starting the display update timer",
    };
    return text.find(" is destructed 0x") != text.npos ||
           std::any_of(beginnings.begin(), beginnings.end(),
                       [text](std::string_view beginning) { return text.starts_with(beginning); });
}

void appendWithoutNumbers(std::string& key, std::string_view text) {
    for (std::size_t at = 0; at < text.size(); ++at) {
        if (!isDigit(text[at])) {
            key += text[at];
        } else {
            key += '#';
            while (at + 1 < text.size() && isDigit(text[at + 1]))
                ++at;
        }
    }
}

} // namespace velmora
