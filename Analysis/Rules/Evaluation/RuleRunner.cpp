// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/RuleRunner.h"

#include <algorithm>

namespace velmora {

RuleRunner::RuleRunner(std::span<const std::shared_ptr<const Rule>> rules, const std::string& technology) {
    std::vector<std::shared_ptr<const Rule>> sorted(rules.begin(), rules.end());
    std::sort(sorted.begin(), sorted.end(), [](const auto& a, const auto& b) { return a->name < b->name; });
    for (const std::shared_ptr<const Rule>& rule : sorted)
        _rules.push_back({RuleState(rule, _inputs, technology), 0, std::nullopt});
    _readers.resize(_inputs.slots().size());
    for (std::uint32_t i = 0; i < _rules.size(); ++i) {
        for (const std::uint32_t slot : _rules[i].state.slots())
            _readers[slot].push_back(i);
        _nextTurn.push_back(i);
    }
}

void RuleRunner::beginTurn(MessageNumber message, Time time) {
    _latest = _latest ? std::max(*_latest, time) : time;
    _inputs.beginTurn(message, *_latest);
}

void RuleRunner::choose(std::uint32_t rule) {
    if (_rules[rule].turn == _inputs.turn())
        return;
    _rules[rule].turn = _inputs.turn();
    _chosen.push_back(rule);
}

void RuleRunner::evaluate(EventSink& sink) {
    _chosen.clear();
    for (const std::uint32_t rule : _nextTurn)
        choose(rule);
    _nextTurn.clear();
    for (const std::uint32_t slot : _inputs.touched())
        for (const std::uint32_t rule : _readers[slot])
            choose(rule);
    for (auto wakeup = _wakeups.begin(); wakeup != _wakeups.end() && wakeup->first <= _inputs.now(); ++wakeup)
        choose(wakeup->second);
    std::sort(_chosen.begin(), _chosen.end());
    for (const std::uint32_t rule : _chosen) {
        Entry& entry = _rules[rule];
        const Wakeup wakeup = entry.state.evaluate(_inputs, sink);
        if (wakeup.atNextMessage)
            _nextTurn.push_back(rule);
        if (wakeup.at == entry.wake)
            continue;
        if (entry.wake)
            _wakeups.erase({*entry.wake, rule});
        if (wakeup.at)
            _wakeups.insert({*wakeup.at, rule});
        entry.wake = wakeup.at;
    }
}

void RuleRunner::interrupt(EventSink& sink) {
    _nextTurn.clear();
    for (std::uint32_t i = 0; i < _rules.size(); ++i) {
        _rules[i].state.interrupt(sink);
        _rules[i].wake.reset();
        _nextTurn.push_back(i);
    }
    _wakeups.clear();
    _inputs.clear();
    _latest.reset();
}

} // namespace velmora
