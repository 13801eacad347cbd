// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "LogGenerator/Fields/Unit.h"
#include "Platform/Clock.h"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace velmora {

/// How much an event matters, the least first.
enum class Severity : std::uint8_t {
    Info,     ///< part of normal operation
    Warning,  ///< worth a look: weak coverage, a ping-pong
    Critical, ///< a user noticed: a lost call, no service
};

/// "info", "warning", "critical".
[[nodiscard]] std::string_view nameOf(Severity severity);
/// The severity of that name, if there is one.
[[nodiscard]] std::optional<Severity> severityNamed(std::string_view name);

/// One thing that is known of an event: what it changed from, and to, a value, a cause.
struct EventField {
    using Value = std::variant<double, bool, std::string>;

    std::string name; ///< "from", "to", "value", "cause", "duration"
    Value value;
    Unit unit = Unit::None; ///< of a number
};

/// Something that happened, made of what messages reported.
struct Event {
    Time time{};             ///< when it happened or began, by the clock of the analysis
    std::optional<Time> end; ///< of one that lasts; absent while it lasts, and where its end is unknown
    bool lasts = false;      ///< whether it has a duration at all
    std::string kind;        ///< as in Documentation/events.md, or the name of a rule
    Severity severity = Severity::Info;
    std::string text;       ///< one line for people, in English
    std::string technology; ///< the short name of the one that reported it
    std::vector<EventField> fields;
    /// The messages that made it, in the order of the input: at most `mostEvidence`, the first and the latest
    /// ones.
    std::vector<MessageNumber> evidence;

    static constexpr std::size_t mostEvidence = 8;

    /// Null where there is none of that name.
    [[nodiscard]] const EventField* field(std::string_view name) const;
};

} // namespace velmora
