// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/EventSink.h"
#include "Analysis/Rules/Evaluation/BoundExpression.h"
#include "Analysis/Rules/Evaluation/Evidence.h"
#include "Analysis/Rules/Evaluation/InputStore.h"
#include "Analysis/Rules/Evaluation/RuleProgress.h"
#include "Analysis/Rules/Rule.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// A rule on its way through the messages of one technology.
class RuleState {
public:
    RuleState(std::shared_ptr<const Rule> rule, InputStore& inputs, std::string technology);

    /// Evaluates the rule in this turn, and passes the events that follow. Returns when to evaluate it again
    /// although no input changes.
    [[nodiscard]] Wakeup evaluate(const InputStore& inputs, EventSink& sink);
    /// Messages are missing: what lasts ends, and nothing of the earlier ones counts any more.
    void interrupt(EventSink& sink);

    [[nodiscard]] const Rule& rule() const { return *_rule; }
    /// The slots of the store whose changes it is to be evaluated for.
    [[nodiscard]] std::vector<std::uint32_t> slots() const;

private:
    void begin(const InputStore& inputs, EventSink& sink);
    void end(std::optional<Time> time, EventSink& sink);
    void fillText(const InputStore& inputs);
    /// The messages that reported what the condition reads.
    [[nodiscard]] std::vector<MessageNumber> reporters(const InputStore& inputs) const;
    [[nodiscard]] bool isTouched(const InputStore& inputs) const;
    /// Whether the message reports a level or a quality that `when` reads, or `when` reads none.
    [[nodiscard]] bool isConfirming(const InputStore& inputs) const;

    std::shared_ptr<const Rule> _rule;
    std::string _technology;
    BoundExpression _when;
    std::vector<std::uint32_t> _measured; ///< slots of levels and qualities that `_when` reads
    std::optional<BoundExpression> _clear;
    std::vector<BoundExpression> _texts; ///< of the text's parts that are values
    RuleProgress _progress;
    Evidence _evidence;
    Event _event; ///< that began
};

} // namespace velmora
