// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Diff/DiffWriter.h"

#include <algorithm>
#include <cstdint>
#include <optional>

namespace velmora {

namespace {

const DiffSide::Display* find(const DiffSide& side, const std::string& technology) {
    const auto found = std::find_if(side.displays().begin(), side.displays().end(),
                                    [&](const auto& display) { return display->technology == technology; });
    return found == side.displays().end() ? nullptr : found->get();
}

bool isIn(const std::vector<std::uint32_t>& rows, const PathPattern::Rows& chosen) {
    for (std::size_t i = 0; i < chosen.size(); ++i)
        if (chosen[i] && (i >= rows.size() || rows[i] != *chosen[i]))
            return false;
    return true;
}

bool isChosen(const ShownValue& value, const LeafChoice& choice) {
    const std::optional<LeafChoice::Leaf> leaf = choice.choose(*value.leaf);
    return leaf &&
           (leaf->rows.empty() || std::any_of(leaf->rows.begin(), leaf->rows.end(),
                                              [&](const auto& rows) { return isIn(value.rows, rows); }));
}

std::vector<ShownValue> chosenOf(const DiffSide::Display* display, const LeafChoice& choice) {
    if (!display)
        return {};
    std::vector<ShownValue> values = display->values.values();
    if (!choice.isEverything())
        std::erase_if(values, [&](const ShownValue& value) { return !isChosen(value, choice); });
    return values;
}

} // namespace

std::vector<TechnologyDifferences> displayDifferences(const DiffSide& a, const DiffSide& b,
                                                      const LeafChoice& choice) {
    std::vector<std::string> technologies;
    for (const DiffSide* const side : {&a, &b})
        for (const auto& display : side->displays())
            if (std::find(technologies.begin(), technologies.end(), display->technology) ==
                technologies.end())
                technologies.push_back(display->technology);
    std::vector<TechnologyDifferences> all;
    for (const std::string& technology : technologies) {
        const DiffSide::Display* const before = find(a, technology);
        const DiffSide::Display* const after = find(b, technology);
        all.push_back({technology, before != nullptr, after != nullptr,
                       compareDisplays(chosenOf(before, choice), chosenOf(after, choice))});
    }
    return all;
}

} // namespace velmora
