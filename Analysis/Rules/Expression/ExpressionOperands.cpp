// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// The operands that ExpressionReader reads: constants, names, paths and calls.

#include "Analysis/Rules/Expression/ExpressionReader.h"
#include "Analysis/Rules/Expression/TypeRules.h"

#include <algorithm>
#include <array>
#include <utility>

namespace velmora {

namespace {

using Operation = ExpressionNode::Operation;
using Kind = ExpressionType::Kind;

constexpr std::array<std::string_view, 10> functions{"age",   "any",   "all",   "abs", "changed",
                                                     "count", "delta", "known", "max", "min"};

bool isPath(const Token& token) {
    return token.kind == Token::Kind::Quoted && token.text.starts_with('/');
}

/// The path of the list whose rows the path goes through.
std::string listOf(const RuleInput& input) {
    return input.isPath() ? input.path.substr(0, input.path.rfind("/*") + 2) : std::string();
}

/// Whether the call, of which the lexer is after the parenthesis, has a comma of its own.
bool hasSecondArgument(Lexer lexer) {
    std::size_t depth = 1;
    for (; lexer.token().kind != Token::Kind::End; lexer.advance()) {
        const Token& token = lexer.token();
        if (token.kind != Token::Kind::Symbol)
            continue;
        if (token.text == "," && depth == 1)
            return true;
        if (token.text == "(")
            ++depth;
        else if (token.text == ")" && --depth == 0)
            return false;
    }
    return false;
}

} // namespace

std::uint32_t ExpressionReader::readOperand() {
    const Token token = _lexer.token();
    if (skipSymbol("(")) {
        const Level level(*this);
        const std::uint32_t inner = readAlternatives();
        expectSymbol(")");
        return inner;
    }
    if (isPath(token))
        return readInput();
    if (token.kind == Token::Kind::Number) {
        _lexer.advance();
        ExpressionNode node{Operation::Number, numberType(token.unit, !token.hasUnit)};
        node.number = token.number;
        return add(std::move(node));
    }
    if (token.kind == Token::Kind::Quoted) {
        _lexer.advance();
        ExpressionNode node{Operation::Text, textType};
        node.text = token.text;
        return add(std::move(node));
    }
    if (isWord("true") || isWord("false")) {
        ExpressionNode node{Operation::Truth, truthType};
        node.number = isWord("true") ? 1 : 0;
        _lexer.advance();
        return add(std::move(node));
    }
    if (token.kind != Token::Kind::Name || isWord("and") || isWord("or") || isWord("not") || isWord("in"))
        failAtToken("a name, a number, a text or a path in quotes");
    if (std::find(functions.begin(), functions.end(), token.text) != functions.end()) {
        _lexer.advance();
        return readCall(token.text, token.position);
    }
    return readInput();
}

std::uint32_t ExpressionReader::readCall(std::string_view name, std::size_t position) {
    expectSymbol("(");
    const Level level(*this);
    if (name == "age")
        return readInputCall(Operation::Age);
    if (name == "known")
        return readInputCall(Operation::Known);
    if (name == "changed")
        return readInputCall(Operation::Changed);
    if (name == "delta")
        return readInputCall(Operation::Delta);
    if (name == "count")
        return readCount(position);
    if (name == "any")
        return readEach(Operation::Any, position);
    if (name == "all")
        return readEach(Operation::All, position);
    if (name == "max")
        return readEach(Operation::Maximum, position);
    if (name == "min")
        return readEach(Operation::Minimum, position);
    const std::size_t start = this->position();
    ExpressionNode node{Operation::Absolute, {}};
    node.first = readSum();
    node.type = typeOf(node.first);
    if (node.type.kind != Kind::Number && node.type.kind != Kind::Any)
        throw ExpressionMistake(start, "got " + describe(node.type) + ", wanted a number");
    expectSymbol(")");
    return add(std::move(node));
}

std::uint32_t ExpressionReader::readInputCall(Operation operation) {
    const std::size_t start = position();
    ExpressionNode node{operation, truthType};
    node.first = readInput();
    node.input = _expression.nodes[node.first].input;
    const RuleInput& input = _expression.inputs[node.input];
    const bool looksBack = operation == Operation::Changed || operation == Operation::Delta;
    if (looksBack && input.isEach())
        throw ExpressionMistake(start,
                                "got a value that there is several times, wanted one that there is once");
    if (operation == Operation::Age)
        node.type = numberType(Unit::Second);
    if (operation != Operation::Delta) {
        expectSymbol(")");
        return add(std::move(node));
    }
    if (input.type.kind != Kind::Number && input.type.kind != Kind::Any)
        throw ExpressionMistake(start, "got " + describe(input.type) + ", wanted a number");
    node.type = input.type.unit == Unit::DBm ? numberType(Unit::DB) : input.type;
    const std::uint32_t first = node.first;
    const std::uint32_t made = add(std::move(node));
    addWindow(made, first, start);
    expectSymbol(")");
    return made;
}

std::uint32_t ExpressionReader::readCount(std::size_t position) {
    if (!hasSecondArgument(_lexer))
        return readEach(Operation::CountEach, position);
    const auto firstNode = static_cast<std::uint32_t>(_expression.nodes.size());
    const std::size_t start = this->position();
    ExpressionNode node{Operation::CountInWindow, numberType(Unit::None)};
    node.first = readAlternatives();
    requireTruth(node.first, start);
    const std::uint32_t made = add(std::move(node));
    addWindow(made, firstNode, position);
    expectSymbol(")");
    return made;
}

std::uint32_t ExpressionReader::readEach(Operation operation, std::size_t position) {
    const std::size_t start = this->position();
    ExpressionNode node{operation, truthType};
    node.first = readEachOperand(position);
    const ExpressionType& type = typeOf(node.first);
    if (operation == Operation::Maximum || operation == Operation::Minimum) {
        if (type.kind != Kind::Number && type.kind != Kind::Any)
            throw ExpressionMistake(start, "got " + describe(type) + ", wanted a number");
        node.type = type;
    } else {
        requireTruth(node.first, start);
        if (operation == Operation::CountEach)
            node.type = numberType(Unit::None);
    }
    return add(std::move(node));
}

std::uint32_t ExpressionReader::readEachOperand(std::size_t position) {
    if (_isInEach)
        throw ExpressionMistake(position, "got two of count(), any(), all(), max() and min() in each other");
    _isInEach = true;
    _list.reset();
    const std::uint32_t operand = readAlternatives();
    _isInEach = false;
    if (!_list)
        throw ExpressionMistake(position, "got no value that there is several times, wanted neighbour.level "
                                          "and the like, or a path with * for the rows of a list");
    expectSymbol(")");
    return operand;
}

std::uint32_t ExpressionReader::readInput() {
    const Token token = _lexer.token();
    if (token.kind != Token::Kind::Name && !isPath(token))
        failAtToken("the name of a role, or a path in quotes");
    Result<RuleInput> input = isPath(token) ? _names.at(token.text) : InputNames::named(token.text);
    if (!input)
        throw ExpressionMistake(token.position, input.reason());
    _lexer.advance();
    if (_isInEach && input->isNeighbour())
        input->kind = RuleInput::Kind::EachNeighbour;
    if (input->isEach())
        enterList(*input, token.position);
    return addInput(std::move(*input));
}

void ExpressionReader::enterList(const RuleInput& input, std::size_t position) {
    if (!_isInEach)
        throw ExpressionMistake(position, "'" + input.path +
                                              "' has a value in each row of a list, wanted it in "
                                              "count(), any(), all(), max() or min()");
    const std::string list = listOf(input);
    if (_list && *_list != list)
        throw ExpressionMistake(position,
                                "got two lists, wanted the same in one count(), any(), all(), max() "
                                "or min()");
    _list = list;
}

std::uint32_t ExpressionReader::addInput(RuleInput input) {
    std::vector<RuleInput>& inputs = _expression.inputs;
    ExpressionNode node{Operation::Input, input.type};
    const auto found = std::find(inputs.begin(), inputs.end(), input);
    node.input = static_cast<std::uint32_t>(found - inputs.begin());
    if (found == inputs.end())
        inputs.push_back(std::move(input));
    return add(std::move(node));
}

void ExpressionReader::addWindow(std::uint32_t node, std::uint32_t firstNode, std::size_t position) {
    if (_isInEach)
        throw ExpressionMistake(position,
                                "got a window of time inside of count(), any(), all(), max() or min()");
    if (_expression.windows.size() == Expression::mostWindows)
        throw ExpressionMistake(position, "got more than " + std::to_string(Expression::mostWindows) +
                                              " windows of time");
    expectSymbol(",");
    const Token token = _lexer.token();
    const std::chrono::duration<double> longest = Expression::longestWindow;
    if (token.kind != Token::Kind::Number || (token.hasUnit && token.unit != Unit::Second))
        failAtToken("a time span as in 10 s");
    if (token.number < 0.001 || token.number > longest.count())
        failAtToken("a time span from 1 ms to 1 h");
    _lexer.advance();
    _expression.nodes[node].window = static_cast<std::uint32_t>(_expression.windows.size());
    _expression.windows.push_back(
        {std::chrono::duration_cast<Time::duration>(std::chrono::duration<double>(token.number)), node,
         firstNode});
}

} // namespace velmora
