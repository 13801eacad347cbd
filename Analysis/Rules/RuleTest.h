// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/RadioPicture.h"
#include "Analysis/Rules/Expression/RuleInput.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "Platform/Clock.h"

#include <cstdint>
#include <optional>
#include <string>
#include <variant>
#include <vector>

namespace velmora {

/// What a rule's test reports at one time. It stands for one message.
struct RuleTestStep {
    struct Value {
        RuleInput input;                          ///< of a path the row's number may be in it
        ObservedKind kind = ObservedKind::Absent; ///< `Absent`: unknown from now on
        double number = 0;
        std::string text{};
    };

    Time::duration at{};
    std::vector<Value> values;
    std::optional<std::vector<Neighbour>> neighbours;
    bool isInterruption = false; ///< messages are missing before it
};

/// An event that a test expects.
struct RuleTestEvent {
    Time::duration time{};
    std::optional<Time::duration> end; ///< absent where it is not known
    std::optional<std::string> text;   ///< absent: any
};

/// What a rule makes of some values, as its author expects it.
struct RuleTest {
    std::string name;
    std::uint32_t line = 0;
    std::uint32_t column = 0;
    std::string technology; ///< the short name
    std::vector<RuleTestStep> steps;
    std::vector<RuleTestEvent> events;
};

} // namespace velmora
