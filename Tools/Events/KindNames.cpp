// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/KindNames.h"

#include "Analysis/Events/EventKind.h"
#include "LogGenerator/Observations/PathPattern.h"

#include <algorithm>

namespace velmora {

namespace {

constexpr std::size_t mostNearest = 3;

std::string nearestTo(const std::string& name, std::vector<std::string> known) {
    std::stable_sort(known.begin(), known.end(), [&name](const std::string& a, const std::string& b) {
        return editDistance(name, a) < editDistance(name, b);
    });
    std::string list;
    for (std::size_t i = 0; i < std::min(mostNearest, known.size()); ++i)
        list += (i == 0 ? "" : ", ") + known[i];
    return list;
}

} // namespace

std::vector<std::string> kindNames(const RuleSet& rules) {
    std::vector<std::string> names;
    for (const EventKindRow& row : eventKinds())
        names.emplace_back(row.name);
    for (const RuleSet::Summary& rule : rules.summaries())
        if (std::find(names.begin(), names.end(), rule.name) == names.end())
            names.emplace_back(rule.name);
    return names;
}

std::optional<std::string> unknownKind(const std::vector<std::string>& given,
                                       const std::vector<std::string>& known) {
    for (const std::string& name : given)
        if (std::find(known.begin(), known.end(), name) == known.end())
            return "got " + name + ", wanted a kind of event; the nearest are " + nearestTo(name, known);
    return std::nullopt;
}

} // namespace velmora
