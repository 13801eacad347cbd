// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/EventSink.h"
#include "Analysis/Rules/Evaluation/InputStore.h"
#include "Analysis/Rules/Evaluation/RuleState.h"
#include "Analysis/Rules/Rule.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <set>
#include <span>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// Evaluates rules turn by turn: of all rules, those whose inputs a message reported and those whose value
/// time alone may have changed. Events of one turn are in the order of the rules' names.
class RuleRunner {
public:
    RuleRunner(std::span<const std::shared_ptr<const Rule>> rules, const std::string& technology);

    /// What rules read. A turn begins with `beginTurn`, then values are set, then `evaluate` follows.
    [[nodiscard]] InputStore& inputs() { return _inputs; }
    [[nodiscard]] const InputStore& inputs() const { return _inputs; }
    /// A message whose time is before the latest one's is taken to be of that time.
    void beginTurn(MessageNumber message, Time time);
    void evaluate(EventSink& sink);
    void interrupt(EventSink& sink);

private:
    struct Entry {
        RuleState state;
        std::uint64_t turn = 0;   ///< in which it was last chosen
        std::optional<Time> wake; ///< as in `_wakeups`
    };

    void choose(std::uint32_t rule);

    InputStore _inputs;
    std::vector<Entry> _rules;
    std::vector<std::vector<std::uint32_t>> _readers; ///< by slot: the rules
    std::set<std::pair<Time, std::uint32_t>> _wakeups;
    std::vector<std::uint32_t> _nextTurn; ///< rules that are evaluated in any case
    std::vector<std::uint32_t> _chosen;
    std::optional<Time> _latest;
};

} // namespace velmora
