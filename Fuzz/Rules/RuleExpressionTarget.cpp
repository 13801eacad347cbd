// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/BoundExpression.h"
#include "Analysis/Rules/Expression/ExpressionParser.h"
#include "Fuzz/FuzzTargets.h"
#include "Fuzz/Rules/RuleCatalogues.h"

#include <chrono>
#include <string>
#include <string_view>

namespace velmora {

namespace {

/// The input is an expression. One without a mistake is evaluated over a few messages.
class RuleExpressionTarget final : public FuzzTarget {
public:
    void run(Bytes input) override {
        const std::string_view text(reinterpret_cast<const char*>(input.data()), input.size());
        // Paths that have been looked up are kept, which must not carry over.
        const InputNames names(_catalogues.all(), InputNames::Further::ArePossible);
        const auto parsed = parseExpression(text, names);
        if (const auto* const mistake = std::get_if<ExpressionError>(&parsed)) {
            require(mistake->position <= text.size(), "a mistake is in the text");
            require(!mistake->text.empty(), "a mistake has a reason");
            return;
        }
        const Expression& expression = std::get<Expression>(parsed);
        require(!expression.nodes.empty(), "an expression has a value");
        InputStore inputs;
        BoundExpression bound(expression, inputs);
        for (int turn = 0; turn < 8; ++turn) {
            inputs.beginTurn({0, static_cast<std::uint64_t>(turn) + 1},
                             Time(std::chrono::seconds(turn * turn)));
            if (turn % 4 != 0)
                fill(inputs, turn);
            Wakeup wakeup;
            const RuleValue value = bound.evaluate(inputs, wakeup);
            require(!value.hasNumber || std::isfinite(value.number), "a number is finite");
            require(!wakeup.at || *wakeup.at >= inputs.now() || wakeup.atNextMessage,
                    "an expression is evaluated again later");
            if (expression.inputs.empty() && turn > 0)
                require(value.isKnown() == _wasKnown && value.number == _number,
                        "an expression that reads nothing is constant");
            _wasKnown = value.isKnown();
            _number = value.number;
        }
    }

private:
    static void fill(InputStore& inputs, int turn) {
        std::vector<Neighbour> neighbours(static_cast<std::size_t>(turn));
        for (std::size_t i = 0; i + 1 < neighbours.size(); ++i)
            neighbours[i].level_dBm = -80.0 - static_cast<double>(i);
        inputs.setNeighbours(neighbours);
        for (std::uint32_t slot = 0; slot < inputs.slots().size(); ++slot) {
            const RuleInput& input = inputs.slot(slot).input;
            const bool isText = input.type.kind == ExpressionType::Kind::Text;
            const ReportedValue value{isText ? ObservedKind::Text : ObservedKind::Number, -100.0 + turn,
                                      "LTE"};
            if (input.kind == RuleInput::Kind::EachRow)
                for (std::uint32_t row = 0; row < 3; ++row)
                    inputs.set(slot, value, {&row, 1});
            else if (!input.isNeighbour())
                inputs.set(slot, value);
        }
        if (turn == 6 && !inputs.slots().empty())
            inputs.remove(0);
    }

    const RuleCatalogues _catalogues;
    bool _wasKnown = false;
    double _number = 0;
};

} // namespace

std::unique_ptr<FuzzTarget> makeRuleExpressionTarget() {
    return std::make_unique<RuleExpressionTarget>();
}

} // namespace velmora
