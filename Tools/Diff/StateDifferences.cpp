// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Diff/StateDifferences.h"

#include <algorithm>

namespace velmora {

namespace {

using Value = StateDifferences::Value;

/// Of one input: sets its member of each value, adding those that are new.
void addShares(std::vector<Value>& values, const StateCounts& states, bool isInList,
               std::optional<double> Value::*side) {
    const auto whole =
        isInList ? static_cast<double>(states.samples()) : static_cast<double>(states.time().count());
    if (whole == 0)
        return; // nothing that shares could be of
    for (Value& each : values)
        each.*side = 0;
    const auto add = [&](const StateCounts::Value& value, bool isOthers) {
        auto found = std::find_if(values.begin(), values.end(), [&](const Value& each) {
            return each.isOthers == isOthers && (isOthers || each.key == value.key);
        });
        if (found == values.end())
            found = values.insert(values.end(), {value.key, value.text, isOthers});
        (*found).*side =
            (isInList ? static_cast<double>(value.samples) : static_cast<double>(value.time.count())) / whole;
    };
    for (const StateCounts::Value& each : states.values())
        add(each, false);
    if (states.hasOthers())
        add(states.at(StateCounts::others), true);
}

} // namespace

StateDifferences::StateDifferences(const LeafPair& pair) {
    const bool isInList = pair.any().isInList();
    if (pair.a) {
        addShares(values, pair.a->states, isInList, &Value::a);
        transitionsOfA = pair.a->states.transitionCount();
    }
    const bool hasA = !values.empty();
    if (pair.b) {
        addShares(values, pair.b->states, isInList, &Value::b);
        transitionsOfB = pair.b->states.transitionCount();
    }
    // What B has alone has no share in A.
    for (Value& each : values)
        if (hasA && !each.a)
            each.a = 0;
}

} // namespace velmora
