// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Files/FileErrors.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

bool continuesCharacter(char c) {
    return (static_cast<unsigned char>(c) & 0xC0U) == 0x80U;
}

void advance(TextPosition& position, char c) {
    if (c == '\n')
        position = {position.line + 1, 1};
    else if (!continuesCharacter(c))
        ++position.column;
}

/// The byte at a position; the end of the file where there is none.
std::size_t offsetOf(std::string_view file, TextPosition wanted) {
    TextPosition position{1, 1};
    std::size_t at = 0;
    while (at < file.size() && (position.line < wanted.line || position.column < wanted.column))
        advance(position, file[at++]);
    while (at < file.size() && continuesCharacter(file[at]))
        ++at;
    return at;
}

} // namespace

void FileErrors::add(TextPosition position, std::string text) {
    if (isFull())
        return;
    ++_count;
    _errors.push_back({_file, position.line, position.column, std::move(text)});
    if (isFull())
        _errors.push_back(
            {_file, 0, 0, "got at least " + std::to_string(most) + " mistakes; the rest is not read"});
}

void FileErrors::addInText(const TOMLNode& text, std::size_t offset, std::string mistake) {
    add(positionInText(_content, text.position, offset), std::move(mistake));
}

TextPosition positionInText(std::string_view file, TextPosition start, std::size_t offset) {
    std::string_view rest = file.substr(offsetOf(file, start));
    const std::size_t quotes = rest.starts_with("\"\"\"") || rest.starts_with("'''") ? 3 : 1;
    TextPosition position = start;
    position.column += static_cast<std::uint32_t>(quotes);
    rest.remove_prefix(std::min(quotes, rest.size()));
    // A line's end right after three quotes does not belong to the text.
    for (const std::string_view lineEnd : {"\r\n", "\n"})
        if (quotes == 3 && rest.starts_with(lineEnd)) {
            position = {position.line + 1, 1};
            rest.remove_prefix(lineEnd.size());
        }
    for (const char c : rest.substr(0, offset)) {
        if (c == '\\')
            return start;
        advance(position, c);
    }
    return position;
}

} // namespace velmora
