// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"
#include "Analysis/Rules/Expression/Expression.h"
#include "Analysis/Rules/Expression/InputNames.h"
#include "Analysis/Rules/RuleTest.h"
#include "Platform/Clock.h"

#include <chrono>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// A part of an event's text: words, or the value of an expression.
struct RuleTextPart {
    std::string words; ///< of words; of a value, the expression as it is written
    std::optional<Expression> value{};
};

/// A rule that has been read from a file and checked.
struct Rule {
    std::string name; ///< the kind of its events
    std::string file;
    std::uint32_t line = 0;
    std::uint32_t column = 0;
    int layer = 0;
    Severity severity = Severity::Warning;
    bool lasts = true; ///< whether its events have a duration
    Expression when;
    std::optional<Expression> clear; ///< absent: what is not `when`
    Time::duration holdFor{0};       ///< how long `when` has to hold until the event begins
    Time::duration keep{0};          ///< how long the end has to last
    std::string text;                ///< with placeholders in braces
    std::vector<RuleTextPart> textParts;
    std::vector<std::string> technologies; ///< short names; empty for all
    std::vector<RuleTest> tests;

    /// How long a condition may be unknown until the rule starts from the beginning.
    static constexpr std::chrono::seconds longestUnknown{10};
    /// How long a level or quality counts as measured after its last report, where a condition has to hold.
    static constexpr std::chrono::seconds longestUnmeasured{2};
};

/// Whether messages of the technology can make the rule's events: it reads something that the catalogue has,
/// and is not for other technologies alone.
[[nodiscard]] bool concerns(const Rule& rule, const Catalogue& catalogue);

} // namespace velmora
