// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace velmora {

/// What can happen without a user's rule: what detectors find, then what the rules that come along find.
enum class EventKind : std::uint8_t {
    CellReselection,
    Handover,
    CellChange,
    TechnologyChange,
    PingPong,
    LateReselection,
    EarlyReselection,
    RadioState,
    RegistrationState,
    MobilityState,
    AreaUpdate,
    OutOfService,
    LimitedService,
    CallSetup,
    CallEnd,
    CallLost,
    Reestablishment,
    ContextUp,
    ContextDown,
    AddressChange,
    EVDOSession,
    SIMChange,
    Gap,
    Malformed,
    ClockJump,
    Note,
    WeakCoverage,
    PoorQuality,
    PilotPollution,
    MissingNeighbour,
    BlockErrorBurst,
    DataStall,
    FERAlarm,
};

/// A kind as Documentation/events.md describes it.
struct EventKindRow {
    EventKind kind;
    std::string_view name; ///< "cell-reselection"
    Severity severity;     ///< unless the event is worse
    bool lasts;            ///< whether it has an end
    bool isStated;         ///< a record states it; otherwise it is derived from several values
    bool isOfRule;         ///< a rule finds it
    std::string_view meaning;
};

/// All kinds, in the order of the enumeration.
[[nodiscard]] std::span<const EventKindRow> eventKinds();
[[nodiscard]] const EventKindRow& rowOf(EventKind kind);
/// The kind of that name; null where there is none.
[[nodiscard]] const EventKindRow* eventKindNamed(std::string_view name);

} // namespace velmora
