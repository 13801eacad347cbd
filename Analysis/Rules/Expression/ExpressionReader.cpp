// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Expression/ExpressionReader.h"

#include "Analysis/Rules/Expression/TypeRules.h"

#include <array>
#include <utility>

namespace velmora {

namespace {

using Operation = ExpressionNode::Operation;

constexpr std::array<std::pair<std::string_view, Operation>, 6> comparisons{{
    {"==", Operation::Equal},
    {"!=", Operation::Unequal},
    {"<", Operation::Less},
    {"<=", Operation::LessOrEqual},
    {">", Operation::Greater},
    {">=", Operation::GreaterOrEqual},
}};

ExpressionNode binary(Operation operation, ExpressionType type, std::uint32_t first, std::uint32_t second) {
    ExpressionNode node{operation, type};
    node.first = first;
    node.second = second;
    return node;
}

} // namespace

ExpressionReader::Level::Level(ExpressionReader& reader) : _reader(reader) {
    if (++_reader._depth > Expression::deepest) {
        --_reader._depth;
        throw ExpressionMistake(_reader.position(), "got more than " + std::to_string(Expression::deepest) +
                                                        " parentheses, calls and signs in each other");
    }
}

Expression ExpressionReader::read() {
    (void)readAlternatives();
    if (_lexer.token().kind != Token::Kind::End)
        failAtToken("an operator or the end");
    return std::move(_expression);
}

std::uint32_t ExpressionReader::readAlternatives() {
    const std::size_t start = position();
    std::uint32_t left = readConjunction();
    while (isWord("or")) {
        requireTruth(left, start);
        _lexer.advance();
        const std::size_t second = position();
        const std::uint32_t right = readConjunction();
        requireTruth(right, second);
        left = add(binary(Operation::Or, truthType, left, right));
    }
    return left;
}

std::uint32_t ExpressionReader::readConjunction() {
    const std::size_t start = position();
    std::uint32_t left = readNegation();
    while (isWord("and")) {
        requireTruth(left, start);
        _lexer.advance();
        const std::size_t second = position();
        const std::uint32_t right = readNegation();
        requireTruth(right, second);
        left = add(binary(Operation::And, truthType, left, right));
    }
    return left;
}

std::uint32_t ExpressionReader::readNegation() {
    if (!isWord("not"))
        return readComparison();
    const Level level(*this);
    _lexer.advance();
    const std::size_t start = position();
    const std::uint32_t operand = readNegation();
    requireTruth(operand, start);
    return add(binary(Operation::Not, truthType, operand, 0));
}

std::uint32_t ExpressionReader::readComparison() {
    const std::uint32_t left = readSum();
    if (isWord("in"))
        return readChoices(left);
    if (isSymbol("="))
        failAtToken("== for a comparison");
    for (const auto& [symbol, operation] : comparisons) {
        if (!isSymbol(symbol))
            continue;
        const std::size_t at = position();
        _lexer.advance();
        const std::uint32_t right = readSum();
        if (const std::string mistake = comparisonMistake(operation, typeOf(left), typeOf(right));
            !mistake.empty())
            throw ExpressionMistake(at, mistake);
        return add(binary(operation, truthType, left, right));
    }
    return left;
}

std::uint32_t ExpressionReader::readChoices(std::uint32_t left) {
    _lexer.advance();
    const auto firstChoice = static_cast<std::uint32_t>(_expression.choices.size());
    if (skipSymbol("(")) {
        do
            readChoice(left);
        while (skipSymbol(","));
        expectSymbol(")");
    } else {
        readChoice(left);
    }
    ExpressionNode node{Operation::In, truthType};
    node.first = left;
    node.choices = firstChoice;
    node.choiceCount = static_cast<std::uint32_t>(_expression.choices.size()) - firstChoice;
    return add(std::move(node));
}

void ExpressionReader::readChoice(std::uint32_t left) {
    const std::size_t start = position();
    ExpressionChoice choice = readBound(left);
    if (!choice.isText && skipSymbol("..")) {
        choice.highest = readBound(left).lowest;
        if (choice.highest < choice.lowest)
            throw ExpressionMistake(start, "got a range whose end is less than its start");
    }
    _expression.choices.push_back(std::move(choice));
}

ExpressionChoice ExpressionReader::readBound(std::uint32_t left) {
    const std::size_t start = position();
    const bool isNegative = skipSymbol("-");
    const Token token = _lexer.token();
    if (token.kind != Token::Kind::Number && (token.kind != Token::Kind::Quoted || isNegative))
        failAtToken("a number or a text in quotes");
    const bool isText = token.kind == Token::Kind::Quoted;
    const ExpressionType type = isText ? textType : numberType(token.unit, !token.hasUnit);
    if (const std::string mistake = comparisonMistake(Operation::In, typeOf(left), type); !mistake.empty())
        throw ExpressionMistake(start, mistake);
    _lexer.advance();
    const double number = isNegative ? -token.number : token.number;
    return {number, number, isText ? std::string(token.text) : std::string(), isText};
}

std::uint32_t ExpressionReader::readSum() {
    std::uint32_t left = readProduct();
    while (isSymbol("+") || isSymbol("-")) {
        const Operation operation = isSymbol("+") ? Operation::Add : Operation::Subtract;
        const std::size_t at = position();
        _lexer.advance();
        const std::uint32_t right = readProduct();
        const Result<ExpressionType> type = arithmeticType(operation, typeOf(left), typeOf(right));
        if (!type)
            throw ExpressionMistake(at, type.reason());
        left = add(binary(operation, *type, left, right));
    }
    return left;
}

std::uint32_t ExpressionReader::readProduct() {
    std::uint32_t left = readSigned();
    while (isSymbol("*") || isSymbol("/")) {
        const Operation operation = isSymbol("*") ? Operation::Multiply : Operation::Divide;
        const std::size_t at = position();
        _lexer.advance();
        const std::uint32_t right = readSigned();
        const Result<ExpressionType> type = arithmeticType(operation, typeOf(left), typeOf(right));
        if (!type)
            throw ExpressionMistake(at, type.reason());
        left = add(binary(operation, *type, left, right));
    }
    return left;
}

std::uint32_t ExpressionReader::readSigned() {
    if (!isSymbol("-"))
        return readOperand();
    const Level level(*this);
    _lexer.advance();
    const std::size_t start = position();
    const std::uint32_t operand = readSigned();
    const ExpressionType type = typeOf(operand);
    if (type.kind != ExpressionType::Kind::Number && type.kind != ExpressionType::Kind::Any)
        throw ExpressionMistake(start, "got " + describe(type) + ", wanted a number");
    return add(binary(Operation::Negate, type, operand, 0));
}

std::uint32_t ExpressionReader::add(ExpressionNode node) {
    _expression.nodes.push_back(std::move(node));
    return static_cast<std::uint32_t>(_expression.nodes.size() - 1);
}

void ExpressionReader::requireTruth(std::uint32_t node, std::size_t position) const {
    if (typeOf(node).kind != ExpressionType::Kind::Truth)
        throw ExpressionMistake(position, "got " + describe(typeOf(node)) + ", wanted a condition");
}

bool ExpressionReader::isSymbol(std::string_view text) const {
    return _lexer.token().kind == Token::Kind::Symbol && _lexer.token().text == text;
}

bool ExpressionReader::isWord(std::string_view text) const {
    return _lexer.token().kind == Token::Kind::Name && _lexer.token().text == text;
}

bool ExpressionReader::skipSymbol(std::string_view text) {
    if (!isSymbol(text))
        return false;
    _lexer.advance();
    return true;
}

void ExpressionReader::expectSymbol(std::string_view text) {
    if (!skipSymbol(text))
        failAtToken(std::string(text));
}

void ExpressionReader::failAtToken(const std::string& wanted) const {
    throw ExpressionMistake(position(), "got " + Lexer::describe(_lexer.token()) + ", wanted " + wanted);
}

} // namespace velmora
