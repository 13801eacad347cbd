// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Expression/Lexer.h"

#include "Analysis/Rules/Expression/RuleUnit.h"
#include "Platform/PrintableText.h"

#include <algorithm>

namespace velmora {

namespace {

bool isBlank(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\r';
}

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

bool isLetter(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '_';
}

std::string_view wordAtFront(std::string_view text) {
    return text.substr(
        0, static_cast<std::size_t>(std::find_if_not(text.begin(), text.end(), isLetter) - text.begin()));
}

constexpr std::string_view symbols[] = {"<=", ">=", "==", "!=", "..", "<", ">", "+",
                                        "-",  "*",  "/",  "(",  ")",  ",", "="};

} // namespace

void Lexer::advance() {
    while (_at < _text.size() && isBlank(_text[_at]))
        ++_at;
    _token = {};
    _token.position = _at;
    if (_at == _text.size())
        return;
    const char first = _text[_at];
    if (isDigit(first))
        readNumber();
    else if (first == '\'' || first == '"')
        readQuoted();
    else if (isLetter(first))
        readName();
    else
        readSymbol();
}

void Lexer::readNumber() {
    const std::optional<FrontNumber> number = numberAtFront(_text.substr(_at));
    if (!number)
        throw ExpressionMistake(_at, "got a number that is too large");
    _token.kind = Token::Kind::Number;
    _token.number = number->value;
    std::size_t end = _at + number->length;
    std::size_t next = end;
    while (next < _text.size() && isBlank(_text[next]))
        ++next;
    if (const std::optional<RuleUnit> unit = unitAtFront(_text.substr(next))) {
        _token.number *= unit->scale;
        _token.unit = unit->unit;
        _token.hasUnit = true;
        end = next + unit->name.size();
    } else if (const std::string_view word = wordAtFront(_text.substr(next));
               !word.empty() && word != "and" && word != "or" && word != "in") {
        throw ExpressionMistake(next, "got the unit " + std::string(word) +
                                          ", wanted dBm, dB, %, kbit/s, Mbit/s, ms, s, min, h, MHz, byte, m, "
                                          "km or deg");
    }
    _token.text = _text.substr(_at, end - _at);
    _at = end;
}

void Lexer::readQuoted() {
    const std::size_t end = _text.find(_text[_at], _at + 1);
    if (end == _text.npos)
        throw ExpressionMistake(_at,
                                std::string("got a ") + _text[_at] + " without another that ends the text");
    _token.kind = Token::Kind::Quoted;
    _token.text = _text.substr(_at + 1, end - _at - 1);
    _at = end + 1;
}

void Lexer::readName() {
    std::size_t end = _at;
    // A hyphen or dot belongs to the name where a letter follows: serving.level, data-rate.
    while (end < _text.size() &&
           (isLetter(_text[end]) || isDigit(_text[end]) ||
            ((_text[end] == '-' || _text[end] == '.') && end + 1 < _text.size() && isLetter(_text[end + 1]))))
        ++end;
    _token.kind = Token::Kind::Name;
    _token.text = _text.substr(_at, end - _at);
    _at = end;
}

void Lexer::readSymbol() {
    for (const std::string_view symbol : symbols)
        if (_text.substr(_at).starts_with(symbol)) {
            _token.kind = Token::Kind::Symbol;
            _token.text = symbol;
            _at += symbol.size();
            return;
        }
    std::size_t end = _at + 1; // with the further bytes of a character
    while (end < _text.size() && (static_cast<unsigned char>(_text[end]) & 0xC0U) == 0x80U)
        ++end;
    throw ExpressionMistake(_at, "got " + printableLine(_text.substr(_at, end - _at)) +
                                     ", wanted a name, a number, a text or an operator");
}

std::string Lexer::describe(const Token& token) {
    if (token.kind == Token::Kind::End)
        return "the end";
    const std::string text = printableLine(token.text);
    return token.kind == Token::Kind::Quoted ? "'" + text + "'" : text;
}

} // namespace velmora
