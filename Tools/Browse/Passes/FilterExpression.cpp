// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Passes/FilterExpression.h"

#include "Analysis/Rules/Expression/ExpressionParser.h"

#include <algorithm>
#include <utility>
#include <variant>

namespace velmora {

Result<std::unique_ptr<FilterExpression>> FilterExpression::make(const std::string& text,
                                                                 const Catalogue& catalogue) {
    const InputNames names({&catalogue}, InputNames::Further::ArePossible);
    std::variant<Expression, ExpressionError> parsed = parseExpression(text, names);
    if (const auto* const error = std::get_if<ExpressionError>(&parsed))
        return Failure{"column " + std::to_string(error->position + 1) + ": " + error->text};
    Expression& expression = std::get<Expression>(parsed);
    if (expression.type().kind != ExpressionType::Kind::Truth)
        return Failure{"got a value, wanted a condition such as serving.level < -110 dBm"};
    return std::unique_ptr<FilterExpression>(new FilterExpression(std::move(expression), catalogue));
}

FilterExpression::FilterExpression(Expression expression, const Catalogue& catalogue)
    : _expression(std::move(expression)), _bound(_expression, _inputs), _roles(_inputs),
      _paths(catalogue, _inputs), _picture(catalogue) {
    _readsPicture = std::any_of(_expression.inputs.begin(), _expression.inputs.end(),
                                [](const RuleInput& input) { return !input.isPath(); });
    _readsNeighbours = std::any_of(_expression.inputs.begin(), _expression.inputs.end(),
                                   [](const RuleInput& input) { return input.isNeighbour(); });
    _wakeup.atNextMessage = true;
}

bool FilterExpression::wants(const CatalogueField& leaf) const {
    // Lists of neighbours take most of the time where nothing reads them.
    const bool isOfPicture = _readsPicture && (_readsNeighbours || !isNeighbour(leaf.role));
    return (isOfPicture && _picture.wants(leaf)) || _paths.reads(leaf);
}

bool FilterExpression::isDue() const {
    return _wakeup.atNextMessage || !_inputs.touched().empty() ||
           (_wakeup.at && *_wakeup.at <= _inputs.now());
}

void FilterExpression::report(const MessageReport& report) {
    // What a malformed message states counts for nothing, as in rules.
    if (report.observed.damage != Damage::None)
        return;
    _latest = _latest ? std::max(*_latest, report.time) : report.time;
    _inputs.beginTurn(report.message, *_latest);
    if (_readsPicture) {
        _picture.update(report);
        _roles.update(_picture, _inputs);
    }
    _paths.update(report.observed, _inputs);
    if (!isDue())
        return;
    _wakeup = {};
    _holds = _bound.evaluate(_inputs, _wakeup).isTrue();
}

} // namespace velmora
