// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Expression/Expression.h"
#include "Analysis/Rules/Expression/InputNames.h"
#include "Analysis/Rules/Expression/Lexer.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// Reads one expression by recursive descent. Its functions return the index of the node that they have
/// made, and throw ExpressionMistake.
class ExpressionReader {
public:
    ExpressionReader(std::string_view text, const InputNames& names) : _lexer(text), _names(names) {}

    [[nodiscard]] Expression read();

private:
    using Operation = ExpressionNode::Operation;

    // In ExpressionReader.cpp: the operators, the loosest first.
    std::uint32_t readAlternatives();
    std::uint32_t readConjunction();
    std::uint32_t readNegation();
    std::uint32_t readComparison();
    std::uint32_t readSum();
    std::uint32_t readProduct();
    std::uint32_t readSigned();
    std::uint32_t readChoices(std::uint32_t left);
    void readChoice(std::uint32_t left);
    ExpressionChoice readBound(std::uint32_t left);

    // In ExpressionOperands.cpp.
    std::uint32_t readOperand();
    std::uint32_t readCall(std::string_view name, std::size_t position);
    std::uint32_t readInputCall(Operation operation);
    std::uint32_t readCount(std::size_t position);
    std::uint32_t readEach(Operation operation, std::size_t position);
    /// Reads the operand of something that goes through neighbours or rows.
    std::uint32_t readEachOperand(std::size_t position);
    std::uint32_t readInput();
    std::uint32_t addInput(RuleInput input);
    void enterList(const RuleInput& input, std::size_t position);
    void addWindow(std::uint32_t node, std::uint32_t firstNode, std::size_t position);

    std::uint32_t add(ExpressionNode node);
    /// Checks that the node's value is a condition.
    void requireTruth(std::uint32_t node, std::size_t position) const;
    [[nodiscard]] bool isSymbol(std::string_view text) const;
    [[nodiscard]] bool isWord(std::string_view text) const;
    [[nodiscard]] bool skipSymbol(std::string_view text);
    void expectSymbol(std::string_view text);
    [[noreturn]] void failAtToken(const std::string& wanted) const;
    [[nodiscard]] std::size_t position() const { return _lexer.token().position; }
    [[nodiscard]] const ExpressionType& typeOf(std::uint32_t node) const {
        return _expression.nodes[node].type;
    }

    /// Counts what is in what, which is what the recursion is bounded by.
    class Level {
    public:
        explicit Level(ExpressionReader& reader);
        ~Level() { --_reader._depth; }
        Level(const Level&) = delete;
        Level& operator=(const Level&) = delete;

    private:
        ExpressionReader& _reader;
    };

    Lexer _lexer;
    const InputNames& _names;
    Expression _expression;
    std::size_t _depth = 0;
    bool _isInEach = false;           ///< inside of count(), any() and the like
    std::optional<std::string> _list; ///< which it goes through; empty for the neighbours
};

} // namespace velmora
