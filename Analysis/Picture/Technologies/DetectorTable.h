// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/EventKind.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace velmora {

/// A state machine whose states are reported at a path, or at two.
struct MachineRow {
    EventKind kind;
    std::string_view machine; ///< what it is called: "RR", "MM"
    std::string_view path;
    std::string_view subPath{}; ///< of its sub-state; empty for none
};

/// What a leaf has to hold: a raw number, or a text where there is one.
struct ValueRow {
    std::string_view path;
    std::int64_t raw = 0;
    std::string_view text{};
};

enum class Service : std::uint8_t { None, Limited, Normal };
/// A value that states whether there is service. Values without a row state nothing.
struct ServiceRow {
    ValueRow value;
    Service service;
};

/// Connected or not: a call is active, a connection is being re-established.
enum class CallState : std::uint8_t { Active, Reestablishing };
struct CallRow {
    ValueRow value;
    CallState state;
};

/// An update of an area that a state machine goes through.
struct AreaUpdateRow {
    std::string_view type; ///< "location", "routing"
    std::string_view statePath;
    std::int64_t updating;                 ///< raw number of the state that lasts as long as the update
    std::int64_t rejected;                 ///< of the one that follows a rejection; -1 for none
    std::string_view statusPath;           ///< of the update status
    std::int64_t accepted;                 ///< raw number of the status after an accepted one
    std::span<const std::int64_t> refused; ///< after one that is not allowed
};

/// A value that is written when an update was accepted.
struct StoredAreaRow {
    std::string_view type;
    std::string_view path;
};

/// Where packet-data contexts are listed.
struct ContextTable {
    std::span<const std::string_view> lists{}; ///< paths of the lists, without their rows
    std::string_view key{};                    ///< the label of what identifies a context
    std::span<const std::string_view> addresses{};
    std::string_view connected{};  ///< the label of the flag without which it is not active; empty for none
    bool isInEveryMessage = false; ///< a message without the list states that there is none
};

/// What the detectors look for in a decoder's display.
struct DetectorTable {
    std::span<const MachineRow> machines{};
    std::span<const ServiceRow> services{};
    std::span<const CallRow> calls{};
    std::span<const AreaUpdateRow> areaUpdates{};
    std::span<const StoredAreaRow> storedAreas{};
    ContextTable contexts{};
    std::span<const std::string_view> sims{}; ///< what identifies the SIM, at one of these paths
    /// The radio mode, which no record states, is a state machine of that name; empty for none.
    std::string_view modeMachine{};
};

} // namespace velmora
