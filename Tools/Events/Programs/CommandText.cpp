// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/Programs/CommandText.h"

#include <utility>

namespace velmora {

Result<std::vector<std::string>> splitCommand(std::string_view text) {
    std::vector<std::string> words;
    std::string word;
    bool hasWord = false; // which may be empty, as ''
    char quote = 0;
    for (std::size_t i = 0; i < text.size(); ++i) {
        const char character = text[i];
        if (character == '\\' && quote != '\'') {
            if (++i == text.size())
                return Failure{"got nothing after the last backslash, wanted a character"};
            word += text[i];
            hasWord = true;
        } else if (quote != 0) {
            if (character == quote)
                quote = 0;
            else
                word += character;
        } else if (character == '\'' || character == '"') {
            quote = character;
            hasWord = true;
        } else if (character == ' ' || character == '\t') {
            if (std::exchange(hasWord, false))
                words.push_back(std::exchange(word, {}));
        } else {
            word += character;
            hasWord = true;
        }
    }
    if (quote != 0)
        return Failure{std::string("got a ") + quote + " without its end, wanted another " + quote};
    if (hasWord)
        words.push_back(std::move(word));
    if (words.empty() || words.front().empty())
        return Failure{"got no program, wanted one and its arguments"};
    return words;
}

} // namespace velmora
