// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Detectors/StateMachines.h"

#include "Analysis/Events/NewEvent.h"
#include "Analysis/Picture/RadioPicture.h"

#include <algorithm>

namespace velmora {

StateMachinesDetector::StateMachinesDetector(const Catalogue& catalogue, const DetectorTable& table)
    : _rows(table.machines), _leaves(catalogue) {
    for (const MachineRow& row : _rows) {
        const auto found = std::find_if(_machines.begin(), _machines.end(), [&row](const Machine& each) {
            return each.kind == row.kind && each.name == row.machine;
        });
        _machineOfRow.push_back(static_cast<std::size_t>(found - _machines.begin()));
        if (found == _machines.end()) {
            _machines.emplace_back();
            _machines.back().kind = row.kind;
            _machines.back().name = row.machine;
        }
    }
}

void StateMachinesDetector::update(const Observation& observation) {
    const auto isOfRow = [this](std::string_view path, std::size_t i) {
        return path == _rows[i].path || (!_rows[i].subPath.empty() && path == _rows[i].subPath);
    };
    for (const std::uint8_t i : _leaves.of(*observation.leaf, _rows.size(), isOfRow)) {
        Machine& machine = _machines[_machineOfRow[i]];
        ReportedValue& value = observation.leaf->path == _rows[i].path ? machine.state : machine.subState;
        if (observation.kind == ObservedKind::Absent)
            machine.isWithdrawn = true;
        else
            machine.isChanged |= value.update(observation, _texts);
    }
}

void StateMachinesDetector::report(const MessageReport& report, const RadioPicture& picture,
                                   EventSink& sink) {
    for (const Observation& each : report.observed.observations)
        update(each);
    for (Machine& each : _machines) {
        if (each.isChanged)
            happened(each, report, picture, sink);
        else if (each.isWithdrawn)
            forget(each);
        each.isChanged = each.isWithdrawn = false;
    }
}

void StateMachinesDetector::happened(Machine& machine, const MessageReport& report,
                                     const RadioPicture& picture, EventSink& sink) {
    std::swap(machine.from, machine.now);
    machine.now = machine.state.text();
    if (machine.subState.isKnown())
        machine.now.append(", ").append(machine.subState.text());
    if (!machine.from.empty() && machine.from != machine.now) {
        Event event = newEvent(machine.kind, report, picture);
        addChange(event, machine.from, machine.now);
        event.text.insert(0, std::string(machine.name) + ": ");
        addField(event, "machine", std::string(machine.name));
        if (machine.since)
            addDuration(event, *machine.since, report.time);
        addEvidence(event, machine.message);
        machine.since = report.time;
        sink.happened(event);
    }
    machine.message = report.message;
}

void StateMachinesDetector::forget(Machine& machine) {
    machine.state.forget();
    machine.subState.forget();
    machine.since.reset();
    machine.now.clear();
}

void StateMachinesDetector::interrupt(Time, EventSink&) {
    for (Machine& each : _machines)
        forget(each);
}

} // namespace velmora
