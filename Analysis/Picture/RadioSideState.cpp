// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/RadioSideState.h"

#include "Analysis/Picture/PhysicalCell.h"

#include <algorithm>

namespace velmora {

namespace {

std::optional<double> numberOf(const Reading* reading) {
    return reading ? std::optional(reading->number) : std::nullopt;
}

bool isOfRow(const Observation& observation, const ModeRow& row) {
    if (row.text.empty())
        return observation.kind != ObservedKind::Text && row.raw == observation.raw;
    return row.text == observation.words;
}

} // namespace

bool isZeroForNone(const Observation& observation, const LeafUse& use, const TechnologyTable& table) {
    return table.hasZerosForNone && observation.number == 0 &&
           (use.role == Role::ServingCell || use.role == Role::ServingChannel);
}

CellIdentity RadioSideState::identity() const {
    CellIdentity known;
    known.technology = technology;
    known.cell = numberOf(readings.find(Role::ServingCell));
    known.channel = numberOf(readings.find(Role::ServingChannel));
    known.physicalCell = numberOf(readings.find(Role::ServingPhysicalCell));
    return known;
}

void RadioSideState::gather(const Observation& observation, const LeafUse& use,
                            const TechnologyTable& table) {
    if (isZeroForNone(observation, use, table))
        return;
    isServing = true;
    if (use.list) {
        if (use.role == Role::ServingPhysicalCell)
            gatherRow(observation, use);
        return;
    }
    switch (use.role) {
    case Role::ServingArea:
        hasNoArea = std::find(table.noAreas.begin(), table.noAreas.end(),
                              static_cast<std::int64_t>(observation.number)) != table.noAreas.end();
        break;
    case Role::ServingCell: found.cell = observation.number; break;
    case Role::ServingChannel: found.channel = observation.number; break;
    case Role::ServingPhysicalCell: found.physicalCell = physicalCellOf(observation); break;
    default: break;
    }
}

/// Of several serving cells, as an active set has them, the known one stays for as long as it is among them.
void RadioSideState::gatherRow(const Observation& observation, const LeafUse& use) {
    const Reading* const known = readings.find(Role::ServingPhysicalCell);
    if (list && !(known && known->number == observation.number))
        return;
    list = use.list;
    row = observation.rows.empty() ? 0 : observation.rows.back();
    found.physicalCell = observation.number;
}

bool RadioSideState::takeMode(const Observation& observation, const LeafUse& use, Time now) {
    isModeReported = true;
    if (use.evidence) {
        if (observation.kind != ObservedKind::Absent) {
            setMode(use.evidence->mode, use.evidence->mode == RadioMode::Connected);
            modeReported = now;
        }
        return false;
    }
    const std::optional<RadioMode> earlier = mode;
    setMode({}, false);
    if (observation.kind != ObservedKind::Absent)
        for (const ModeRow& each : use.modes->rows)
            if (isOfRow(observation, each))
                setMode(each.mode, each.isMovedByNetwork);
    return mode != earlier && (mode == RadioMode::Off || mode == RadioMode::Searching);
}

bool RadioSideState::reportsCell(const TechnologyTable& table) const {
    if (hasNoArea)
        return false;
    return !table.searched || technology != table.searched || mode == RadioMode::Idle ||
           mode == RadioMode::Connected;
}

void RadioSideState::forgetCell() {
    readings.forgetServing();
    isReported = false;
    before.reset();
    since.reset();
}

void RadioSideState::forgetAll() {
    forgetCell();
    readings.forgetAll();
    setMode({}, false);
}

} // namespace velmora
