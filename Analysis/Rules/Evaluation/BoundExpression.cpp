// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/BoundExpression.h"

#include "Analysis/Rules/Evaluation/Evaluator.h"

#include <algorithm>

namespace velmora {

namespace {

using Operation = ExpressionNode::Operation;

bool readsInput(Operation operation) {
    return operation == Operation::Input || operation == Operation::Age || operation == Operation::Known ||
           operation == Operation::Changed || operation == Operation::Delta;
}

bool isAnyTouched(std::span<const std::uint32_t> slots, const InputStore& inputs) {
    return std::any_of(slots.begin(), slots.end(),
                       [&inputs](std::uint32_t slot) { return inputs.isTouched(slot); });
}

} // namespace

BoundExpression::BoundExpression(const Expression& expression, InputStore& inputs)
    : _expression(&expression), _windowValues(expression.windows.size()), _columns(expression),
      _kept(expression) {
    for (const RuleInput& each : expression.inputs)
        _slots.push_back(inputs.add(each));
    for (const ExpressionWindow& each : expression.windows) {
        Window& window = _windows.emplace_back();
        for (std::uint32_t node = each.firstNode; node <= each.node; ++node)
            if (readsInput(expression.nodes[node].operation))
                window.slots.push_back(_slots[expression.nodes[node].input]);
    }
}

RuleValue BoundExpression::evaluate(const InputStore& inputs, Wakeup& wakeup) {
    for (std::size_t i = 0; i < _windows.size(); ++i)
        if (_expression->nodes[_expression->windows[i].node].operation == Operation::Delta)
            updateDelta(i, inputs, wakeup);
        else
            updateCount(i, inputs, wakeup);
    return Evaluator(*_expression, _slots, inputs, _windowValues, _columns, _kept, wakeup).value();
}

void BoundExpression::clear() {
    for (Window& each : _windows)
        each.samples.clear();
}

void BoundExpression::updateDelta(std::size_t index, const InputStore& inputs, Wakeup& wakeup) {
    const Time::duration length = _expression->windows[index].length;
    const Time now = inputs.now();
    std::deque<std::pair<Time, double>>& samples = _windows[index].samples;
    const std::uint32_t slot = _windows[index].slots.front();
    const std::vector<InputCell>& cells = inputs.slot(slot).cells;
    const bool isKnown =
        !cells.empty() && cells.front().isKnown() && cells.front().kind == ObservedKind::Number;
    // A value that is reported sooner after the last one is left out, so that their number is bounded.
    constexpr int mostInLength = static_cast<int>(mostSamples) - 2;
    if (isKnown && inputs.isTouched(slot) &&
        (samples.empty() || now - samples.back().first >= length / mostInLength))
        samples.emplace_back(now, cells.front().number);
    _windowValues[index] = RuleValue::unknown();
    if (samples.empty())
        return;
    // The window ends with the latest report: if it went on without reports, it would lose what was reported
    // first, and its value would be that of an ever shorter time.
    const Time reported = cells.empty() ? samples.back().first : cells.front().time;
    const bool isOver = now - reported >= length;
    const Time start = (isOver ? now : reported) - length;
    while (samples.size() > 1 && samples[1].first <= start)
        samples.pop_front();
    if (isKnown && samples.front().first <= start)
        _windowValues[index] = RuleValue::of(cells.front().number - samples.front().second);
    if (!isOver)
        wakeup.by(reported + length);
}

void BoundExpression::updateCount(std::size_t index, const InputStore& inputs, Wakeup& wakeup) {
    const Time::duration length = _expression->windows[index].length;
    const Time now = inputs.now();
    Window& window = _windows[index];
    if (isAnyTouched(window.slots, inputs)) {
        const std::uint32_t operand = _expression->nodes[_expression->windows[index].node].first;
        Evaluator evaluator(*_expression, _slots, inputs, _windowValues, _columns, _kept, wakeup);
        if (evaluator.evaluate(operand).isTrue()) {
            if (window.samples.size() == mostSamples)
                window.samples.pop_front();
            window.samples.emplace_back(now, 1);
        }
    }
    while (!window.samples.empty() && window.samples.front().first <= now - length)
        window.samples.pop_front();
    if (!window.samples.empty())
        wakeup.by(window.samples.front().first + length);
    _windowValues[index] = RuleValue::of(static_cast<double>(window.samples.size()));
}

} // namespace velmora
