// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/KindNames.h"

#include "Analysis/Events/EventKind.h"

#include <algorithm>
#include <utility>

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

std::size_t editDistance(std::string_view one, std::string_view other) {
    // The last three rows of the table of the distances of all prefixes.
    std::vector<std::size_t> beforeLast;
    std::vector<std::size_t> last(other.size() + 1);
    for (std::size_t j = 0; j < last.size(); ++j)
        last[j] = j;
    for (std::size_t i = 1; i <= one.size(); ++i) {
        std::vector<std::size_t> row(other.size() + 1, i);
        for (std::size_t j = 1; j <= other.size(); ++j) {
            const std::size_t replaced = last[j - 1] + (one[i - 1] == other[j - 1] ? 0 : 1);
            row[j] = std::min({last[j] + 1, row[j - 1] + 1, replaced});
            if (i > 1 && j > 1 && one[i - 1] == other[j - 2] && one[i - 2] == other[j - 1])
                row[j] = std::min(row[j], beforeLast[j - 2] + 1);
        }
        beforeLast = std::exchange(last, std::move(row));
    }
    return last.back();
}

} // namespace velmora
