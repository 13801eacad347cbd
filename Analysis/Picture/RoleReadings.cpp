// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/RoleReadings.h"

#include "Analysis/Picture/LeafUse.h"
#include "Analysis/Picture/PhysicalCell.h"

#include <algorithm>

namespace velmora {

void RoleReadings::keep(Role role, const Observation& observation, const MessageReport& report,
                        ObservedText& text) {
    Slot& slot = _slots[static_cast<std::size_t>(role)];
    Reading& reading = slot.reading;
    const bool isNumber = observation.kind == ObservedKind::Number;
    double number = isNumber ? observation.number : static_cast<double>(observation.raw);
    if (role == Role::ServingPhysicalCell)
        number = physicalCellOf(observation).value_or(number);
    bool isSame = slot.isKnown && reading.kind == observation.kind && reading.number == number;
    if (observation.kind == ObservedKind::Text) {
        isSame = isSame && reading.text == observation.words;
        if (!isSame)
            reading.text.assign(observation.words);
    } else if (!isSame || reading.leaf != observation.leaf) {
        reading.text.clear();
        if (observation.kind == ObservedKind::Enumeration)
            reading.text.assign(text.of(observation));
    }
    if (!isSame)
        reading.since = report.time;
    reading.kind = observation.kind;
    reading.number = number;
    reading.time = report.time;
    reading.message = report.message;
    reading.leaf = observation.leaf;
    slot.isKnown = true;
}

void RoleReadings::keepNeighbour(const Neighbour& cell) {
    const auto keepNumber = [this, &cell](Role role, const std::optional<double>& number) {
        Slot& slot = _slots[static_cast<std::size_t>(role)];
        slot.isKnown = number.has_value();
        if (!number)
            return;
        slot.reading.kind = ObservedKind::Number;
        slot.reading.number = *number;
        slot.reading.time = slot.reading.since = cell.time;
        slot.reading.message = cell.message;
    };
    keepNumber(Role::NeighbourChannel, cell.channel);
    keepNumber(Role::NeighbourPhysicalCell, cell.physicalCell);
    keepNumber(Role::NeighbourLevel, cell.level_dBm);
    keepNumber(Role::NeighbourQuality, cell.quality_dB);
}

void RoleReadings::forgetLeaf(Role role, const CatalogueField& leaf) {
    Slot& slot = _slots[static_cast<std::size_t>(role)];
    if (slot.reading.leaf == &leaf)
        slot.isKnown = false;
}

void RoleReadings::forgetServing() {
    for (std::size_t i = 0; i < _slots.size(); ++i)
        if (isServing(static_cast<Role>(i)))
            _slots[i].isKnown = false;
}

bool RoleReadings::isEmpty() const {
    return std::none_of(_slots.begin(), _slots.end(), [](const Slot& each) { return each.isKnown; });
}

void RoleReadings::forgetAll() {
    for (Slot& each : _slots)
        each.isKnown = false;
}

} // namespace velmora
