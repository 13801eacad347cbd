// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/CellIdentity.h"

#include <cmath>
#include <cstdint>

namespace velmora {

namespace {

template <class Value>
bool areDifferent(const std::optional<Value>& one, const std::optional<Value>& other) {
    return one && other && *one != *other;
}

bool areEqual(const std::optional<double>& one, const std::optional<double>& other) {
    return one && other && *one == *other;
}

std::string numbered(std::string_view name, double number) {
    return std::string(name) + ' ' + std::to_string(std::llround(number));
}

} // namespace

std::optional<bool> areSameCell(const CellIdentity& one, const CellIdentity& other) {
    if (areDifferent(one.technology, other.technology) || areDifferent(one.cell, other.cell) ||
        areDifferent(one.channel, other.channel) || areDifferent(one.physicalCell, other.physicalCell))
        return false;
    if (areEqual(one.cell, other.cell) || areEqual(one.physicalCell, other.physicalCell))
        return true;
    return std::nullopt;
}

std::string nameOf(const CellIdentity& cell) {
    const RadioTechnology technology = cell.technology.value_or(RadioTechnology::GSM);
    std::string name;
    if (cell.physicalCell)
        name =
            numbered(cell.technology ? physicalCellNameOf(technology) : "physical cell", *cell.physicalCell);
    else if (cell.cell)
        name = numbered("cell", *cell.cell);
    if (!cell.channel)
        return name;
    const std::string channel =
        numbered(cell.technology ? channelNameOf(technology) : "channel", *cell.channel);
    return name.empty() ? channel : name + " on " + channel;
}

} // namespace velmora
