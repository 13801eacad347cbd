// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Evaluation/RuleValue.h"
#include "Analysis/Rules/Evaluation/Wakeup.h"
#include "Analysis/Rules/Rule.h"
#include "Platform/Clock.h"

#include <cstdint>
#include <optional>

namespace velmora {

/// How far a rule is from its next event, or from the end of the current one.
class RuleProgress {
public:
    enum class Outcome : std::uint8_t {
        Nothing,
        Starts, ///< `when` holds: an event if it goes on for long enough
        Begins, ///< an event, which began at `begin()`
        Ends,   ///< at `end()`
        Lost    ///< the event's end is not known
    };

    /// The rule must outlive it.
    explicit RuleProgress(const Rule& rule) : _rule(rule) {}

    /// The condition and what ends the event, at that time. `isConfirming`: the message reports what the
    /// condition was measured by. To be called again while it does not return `Nothing`.
    [[nodiscard]] Outcome step(Time now, const RuleValue& when, const RuleValue& ends, bool isConfirming,
                               Wakeup& wakeup);
    /// Starts from the beginning.
    void reset();

    [[nodiscard]] bool isActive() const { return _isActive; }
    /// Whether `when` has held and an event may have begun.
    [[nodiscard]] bool hasBegun() const { return _begin.has_value(); }
    [[nodiscard]] Time begin() const { return *_begin; }
    /// Since when what ends the event has held; absent where it does not.
    [[nodiscard]] std::optional<Time> end() const { return _end; }

private:
    [[nodiscard]] Outcome stepIdle(Time now, const RuleValue& when, const RuleValue& ends, bool isConfirming,
                                   Wakeup& wakeup);
    [[nodiscard]] Outcome stepActive(Time now, const RuleValue& ends, Wakeup& wakeup);
    /// Whether it has been unknown for too long.
    [[nodiscard]] bool isLost(Time now, bool isKnown, Wakeup& wakeup);

    const Rule& _rule;
    bool _isActive = false;
    std::optional<Time> _begin;     ///< since when `when` has held
    std::optional<Time> _confirmed; ///< when a report after `_begin` did so last
    std::optional<Time> _end;       ///< since when what ends the event has held
    std::optional<Time> _unknown;   ///< since when the condition has been unknown
};

} // namespace velmora
