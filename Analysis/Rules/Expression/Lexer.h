// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Unit.h"

#include <cstddef>
#include <stdexcept>
#include <string>
#include <string_view>

namespace velmora {

/// A mistake in an expression, thrown by its lexer and parser and caught by `parseExpression`.
class ExpressionMistake : public std::runtime_error {
public:
    ExpressionMistake(std::size_t position, const std::string& text)
        : std::runtime_error(text), _position(position) {}

    [[nodiscard]] std::size_t position() const { return _position; }

private:
    std::size_t _position;
};

/// A token of an expression.
struct Token {
    enum class Kind { End, Number, Quoted, Name, Symbol };

    Kind kind = Kind::End;
    std::size_t position = 0; ///< in bytes
    std::string_view text;    ///< as it is written; of a quoted text what is between the quotes
    double number = 0;        ///< in `unit`
    Unit unit = Unit::None;
    bool hasUnit = false;
};

/// Splits an expression into tokens. The text must outlive it.
class Lexer {
public:
    explicit Lexer(std::string_view text) : _text(text) { advance(); }

    [[nodiscard]] const Token& token() const { return _token; }
    /// Goes to the next token; throws ExpressionMistake.
    void advance();
    /// As it is written, for messages: "the end" or in quotes.
    [[nodiscard]] static std::string describe(const Token& token);

private:
    void readNumber();
    void readQuoted();
    void readName();
    void readSymbol();

    std::string_view _text;
    std::size_t _at = 0;
    Token _token;
};

} // namespace velmora
