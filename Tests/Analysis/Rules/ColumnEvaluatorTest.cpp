// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/ColumnEvaluator.h"

#include "Tests/Analysis/Rules/RuleFixture.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <optional>
#include <string>
#include <vector>

namespace velmora {
namespace {

Expression parsed(const std::string& text) {
    const std::span<const Catalogue* const> all = ShippedCatalogues::instance().all();
    return std::get<Expression>(parseExpression(text, InputNames({all.begin(), all.end()})));
}

/// Whether the operand of the expression, which has to go through neighbours, is evaluated by columns.
bool isByColumns(const std::string& text) {
    const Expression expression = parsed(text);
    return ColumnEvaluator(expression).canEvaluate(expression.nodes.back());
}

TEST(ColumnEvaluatorTest, TakesWhatDoesNotDependOnTimeOrText) {
    EXPECT_TRUE(isByColumns("any(neighbour.level > serving.level - 5 dB)"));
    EXPECT_TRUE(isByColumns("count(neighbour.level > -90 and not known(neighbour.channel))"));
    EXPECT_TRUE(isByColumns("max(abs(neighbour.level - serving.level))"));
    EXPECT_TRUE(isByColumns("all(neighbour.detected or true)"));
    EXPECT_FALSE(isByColumns("any(age(neighbour.level) > 2 s)"));
    EXPECT_FALSE(isByColumns("any(neighbour.level in -90..-80)"));
    EXPECT_FALSE(isByColumns("any(neighbour.level > -90 and age(serving.level) > 2 s)"));
    EXPECT_FALSE(isByColumns("any('/UMTS/Active Set/*/RSCP' > -90)"));
}

std::string number(int low, int high) {
    return std::to_string(*rc::gen::inRange(low, high));
}

std::string comparison() {
    return *rc::gen::element<std::string>(" < ", " <= ", " > ", " >= ", " == ", " != ");
}

std::string givenLevel() {
    switch (*rc::gen::inRange(0, 5)) {
    case 0: return "neighbour.level";
    case 1: return "serving.level - " + number(-3, 4);
    case 2: return "-(-neighbour.level)";
    case 3: return "neighbour.level * 2 / " + number(0, 3); // also by 0
    default: return "-" + number(90, 96);
    }
}

/// A condition of neighbours. Numbers are few, so that they meet often.
std::string givenCondition(int depth) {
    const int kind = *rc::gen::inRange(0, depth > 0 ? 9 : 6);
    switch (kind) {
    case 0: return "neighbour.detected";
    case 1: return "known(neighbour.channel)";
    case 2: return "neighbour.channel" + comparison() + "serving.channel";
    case 3: return "abs(neighbour.level - serving.level)" + comparison() + number(0, 4) + " dB";
    case 4: return "neighbour.level" + comparison() + givenLevel();
    case 5: return *rc::gen::element<std::string>("true", "known(serving.level)", "neighbour.quality > -9");
    case 6: return "not (" + givenCondition(depth - 1) + ")";
    default: break;
    }
    const std::string first = givenCondition(depth - 1);
    return "(" + first + (kind == 7 ? ") and (" : ") or (") + givenCondition(depth - 1) + ")";
}

std::optional<double> givenNumber(int low, int high) {
    return *rc::gen::arbitrary<bool>() ? std::optional<double>(*rc::gen::inRange(low, high)) : std::nullopt;
}

std::vector<Neighbour> givenNeighbours() {
    std::vector<Neighbour> cells(*rc::gen::inRange<std::size_t>(0, 5));
    for (Neighbour& each : cells) {
        each.channel = givenNumber(1, 3);
        each.physicalCell = givenNumber(0, 3);
        each.level_dBm = givenNumber(-96, -89);
        each.quality_dB = givenNumber(-12, -6);
        each.isDetected = *rc::gen::arbitrary<bool>();
        each.time = at(0);
    }
    return cells;
}

std::string valueOf(const std::string& text, const std::vector<Neighbour>& cells, std::optional<double> level,
                    std::optional<double> channel) {
    EvaluatedExpression expression(text);
    expression.neighbours(cells);
    if (level && text.find("serving.level") != std::string::npos)
        expression.set("serving.level", *level);
    if (channel && text.find("serving.channel") != std::string::npos)
        expression.set("serving.channel", *channel);
    return expression.value();
}

RC_GTEST_PROP(ColumnEvaluatorTest, HasTheSameAnswersAsTheEvaluationOfOneNeighbourAfterTheOther, ()) {
    const std::string condition = "neighbour.detected and false or (" + givenCondition(2) + ")";
    const std::vector<Neighbour> cells = givenNeighbours();
    const std::optional<double> level = givenNumber(-95, -90);
    const std::optional<double> channel = givenNumber(1, 3);
    // An age is not evaluated by columns; that it is no less than 0 changes no answer.
    const std::string ordinary = "(" + condition + ") and age(neighbour.level) >= 0 s";
    for (const std::string function : {"count(", "any(", "all("}) {
        RC_ASSERT(isByColumns(function + condition + ")"));
        RC_ASSERT(!isByColumns(function + ordinary + ")"));
        RC_ASSERT(valueOf(function + condition + ")", cells, level, channel) ==
                  valueOf(function + ordinary + ")", cells, level, channel));
    }
}

} // namespace
} // namespace velmora
