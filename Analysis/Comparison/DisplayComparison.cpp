// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Comparison/DisplayComparison.h"

#include "Analysis/Comparison/NamingNumber.h"

#include <map>
#include <string>
#include <utility>

namespace velmora {

namespace {

using Place = std::pair<std::string_view, std::string_view>; ///< path and row

Place placeOf(const ShownValue& value) {
    return {value.leaf->path, value.row};
}

std::map<Place, const ShownValue*> byPlace(const std::vector<ShownValue>& values) {
    std::map<Place, const ShownValue*> places;
    for (const ShownValue& each : values)
        places.emplace(placeOf(each), &each);
    return places;
}

} // namespace

std::optional<double> DisplayDifference::difference() const {
    if (!before || !after || before->kind != ObservedKind::Number || after->kind != ObservedKind::Number)
        return std::nullopt;
    if (isNamingNumber(*after->leaf))
        return std::nullopt;
    return after->number - before->number;
}

std::string_view nameOf(DisplayDifference::Change change) {
    switch (change) {
    case DisplayDifference::Change::Added: return "added";
    case DisplayDifference::Change::Gone: return "gone";
    case DisplayDifference::Change::Changed: break;
    }
    return "changed";
}

std::vector<DisplayDifference> compareDisplays(const std::vector<ShownValue>& before,
                                               const std::vector<ShownValue>& after) {
    const auto earlier = byPlace(before);
    const auto later = byPlace(after);
    std::vector<DisplayDifference> differences;
    // Both are in the order of one catalogue, which grows at its end: what is gone goes before what follows
    // it.
    auto gone = before.begin();
    const auto passGone = [&](const ShownValue* next) {
        for (; gone != before.end() && (!next || gone->group < next->group); ++gone)
            if (!later.contains(placeOf(*gone)))
                differences.push_back({*gone, std::nullopt});
    };
    for (const ShownValue& value : after) {
        passGone(&value);
        const auto found = earlier.find(placeOf(value));
        if (found == earlier.end())
            differences.push_back({std::nullopt, value});
        else if (!found->second->isSame(value))
            differences.push_back({*found->second, value});
    }
    passGone(nullptr);
    return differences;
}

} // namespace velmora
