// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Events/EventKind.h"

#include <algorithm>
#include <array>
#include <cstddef>

namespace velmora {

namespace {

using enum EventKind;
using enum Severity;

constexpr bool lasts = true;
constexpr bool once = false;
constexpr bool stated = true;
constexpr bool derived = false;
constexpr bool ofRule = true;
constexpr bool builtIn = false;

constexpr std::array<EventKindRow, 33> rows{{
    {CellReselection, "cell-reselection", Info, once, derived, builtIn, "the phone moved to another cell"},
    {Handover, "handover", Info, once, derived, builtIn, "the network moved the phone to another cell"},
    {CellChange, "cell-change", Info, once, stated, builtIn, "another serving cell; by whom is not known"},
    {TechnologyChange, "technology-change", Info, once, stated, builtIn,
     "the serving cell is of another radio technology"},
    {PingPong, "ping-pong", Warning, once, derived, builtIn,
     "back to the cell that the phone left shortly before"},
    {LateReselection, "late-reselection", Warning, once, derived, builtIn,
     "a neighbour was better for long before the phone moved"},
    {EarlyReselection, "early-reselection", Warning, once, derived, builtIn,
     "the phone moved to a cell that was not better"},
    {RadioState, "radio-state", Info, once, stated, builtIn, "another state of the radio-resource layer"},
    {RegistrationState, "registration-state", Info, once, stated, builtIn, "another state of registration"},
    {MobilityState, "mobility-state", Info, once, stated, builtIn, "another state of mobility management"},
    {AreaUpdate, "area-update", Info, once, derived, builtIn,
     "a location, routing or tracking area update, and its outcome"},
    {OutOfService, "out-of-service", Critical, lasts, stated, builtIn, "no service"},
    {LimitedService, "limited-service", Warning, lasts, stated, builtIn, "emergency calls alone"},
    {CallSetup, "call-setup", Info, once, stated, builtIn, "a circuit-switched call is connected"},
    {CallEnd, "call-end", Info, once, stated, builtIn, "a circuit-switched call ended"},
    {CallLost, "call-lost", Critical, once, derived, builtIn, "a circuit-switched call was lost"},
    {Reestablishment, "re-establishment", Warning, once, stated, builtIn,
     "a connection is being re-established"},
    {ContextUp, "context-up", Info, once, stated, builtIn, "a packet-data context is active"},
    {ContextDown, "context-down", Info, once, stated, builtIn,
     "a packet-data context is not active any more"},
    {AddressChange, "address-change", Info, once, stated, builtIn, "an active context has another address"},
    {EVDOSession, "evdo-session", Info, once, stated, builtIn, "another state of the EV-DO session"},
    {SIMChange, "sim-change", Warning, once, stated, builtIn, "another SIM"},
    {Gap, "gap", Warning, lasts, stated, builtIn, "no message for more than 30 s"},
    {Malformed, "malformed", Warning, once, stated, builtIn, "a message, or what holds it, is malformed"},
    {ClockJump, "clock-jump", Warning, once, stated, builtIn, "the clock went back, or leapt ahead"},
    {Note, "note", Info, once, stated, builtIn, "a comment on a message of the recording"},
    {WeakCoverage, "weak-coverage", Warning, lasts, derived, ofRule, "the level of the serving cell is low"},
    {PoorQuality, "poor-quality", Warning, lasts, derived, ofRule, "the quality of the serving cell is low"},
    {PilotPollution, "pilot-pollution", Warning, lasts, derived, ofRule,
     "too many cells are about as strong as the serving one"},
    {MissingNeighbour, "missing-neighbour", Warning, lasts, derived, ofRule,
     "a detected cell is stronger than the serving one"},
    {BlockErrorBurst, "block-error-burst", Warning, lasts, derived, ofRule, "many blocks are in error"},
    {DataStall, "data-stall", Warning, lasts, derived, ofRule, "a data connection transfers nothing"},
    {FERAlarm, "fer-alarm", Warning, lasts, derived, ofRule, "many frames are in error"},
}};

consteval bool areInOrder() {
    for (std::size_t i = 0; i < rows.size(); ++i)
        if (static_cast<std::size_t>(rows[i].kind) != i)
            return false;
    return true;
}
static_assert(areInOrder());

} // namespace

std::span<const EventKindRow> eventKinds() {
    return rows;
}

const EventKindRow& rowOf(EventKind kind) {
    return rows[static_cast<std::size_t>(kind)];
}

const EventKindRow* eventKindNamed(std::string_view name) {
    const auto found =
        std::find_if(rows.begin(), rows.end(), [name](const EventKindRow& row) { return row.name == name; });
    return found == rows.end() ? nullptr : &*found;
}

} // namespace velmora
