// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Detectors/LeafRows.h"
#include "Analysis/Detectors/ReportedValue.h"
#include "Analysis/Engine/Detector.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Reports that a state machine is in another state than before: of the radio, of registration, of mobility
/// management, of the EV-DO session. The first state that is seen is none.
class StateMachinesDetector final : public Detector {
public:
    StateMachinesDetector(const Catalogue& catalogue, const DetectorTable& table);

    void report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) override;
    void interrupt(Time last, EventSink& sink) override;

private:
    /// The rows of one machine, which one display shows at one of several paths.
    struct Machine {
        EventKind kind;
        std::string_view name;
        ReportedValue state;
        ReportedValue subState;
        bool isChanged = false;    ///< by this message
        bool isWithdrawn = false;  ///< by this message
        std::string from;          ///< its text before this message
        std::string now;           ///< its text
        std::optional<Time> since; ///< absent where the beginning was not seen
        MessageNumber message;     ///< that reported it first
    };

    void update(const Observation& observation);
    void happened(Machine& machine, const MessageReport& report, const RadioPicture& picture,
                  EventSink& sink);
    static void forget(Machine& machine);

    std::span<const MachineRow> _rows;
    LeafRows _leaves;
    std::vector<Machine> _machines;
    std::vector<std::size_t> _machineOfRow;
    ObservedText _texts;
};

} // namespace velmora
