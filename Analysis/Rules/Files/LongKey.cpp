// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Files/TOMLReader.h"

namespace velmora {

namespace {

/// Goes through a document as far as it is well-formed, over its strings and comments.
class KeyScan {
public:
    explicit KeyScan(std::string_view text) : _text(text) {}

    std::optional<TextPosition> run() {
        while (_at < _text.size()) {
            const char c = _text[_at];
            if (c == '"' || c == '\'')
                skipString(c);
            else if (c == '#')
                skipUntilLineEnd();
            else if (c == '.')
                ++_dots;
            else if (c == '\n' || c == '=' || c == ',' || c == '[' || c == '{')
                _dots = 0;
            if (_dots >= deepestTOML)
                return position();
            ++_at;
        }
        return std::nullopt;
    }

private:
    /// To the last character of a string of one or of several lines.
    void skipString(char quote) {
        const std::string three(3, quote);
        const bool hasLines = _text.substr(_at).starts_with(three);
        _at += hasLines ? three.size() : 1;
        while (_at < _text.size()) {
            if (quote == '"' && _text[_at] == '\\') {
                _at += 2;
                continue;
            }
            if (hasLines ? _text.substr(_at).starts_with(three) : _text[_at] == quote) {
                _at += hasLines ? 2 : 0;
                // Up to two quotes before the closing ones belong to the string.
                while (hasLines && _at + 1 < _text.size() && _text[_at + 1] == quote)
                    ++_at;
                return;
            }
            ++_at;
        }
    }

    void skipUntilLineEnd() {
        while (_at + 1 < _text.size() && _text[_at + 1] != '\n')
            ++_at;
    }

    [[nodiscard]] TextPosition position() const {
        TextPosition position{1, 1};
        for (const char c : _text.substr(0, _at)) {
            const bool continues = (static_cast<unsigned char>(c) & 0xC0U) == 0x80U;
            position.column = c == '\n' ? 1 : position.column + (continues ? 0 : 1);
            position.line += c == '\n' ? 1 : 0;
        }
        return position;
    }

    std::string_view _text;
    std::size_t _at = 0;
    std::size_t _dots = 0; ///< between the parts of the key
};

} // namespace

std::optional<TextPosition> longKey(std::string_view text) {
    return KeyScan(text).run();
}

} // namespace velmora
