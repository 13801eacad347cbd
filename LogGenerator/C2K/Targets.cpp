// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/Targets.h"

#include "LogGenerator/C2K/ValueKeys.h"

#include <set>
#include <string>
#include <string_view>
#include <utility>

namespace velmora::C2K {

namespace {

using Target = std::pair<const Dictionary*, std::string_view>;

void findSelected(const Dictionary& screen, const PathRests& selected, bool atRoot, std::set<Target>& found) {
    // In a sorted screen a key is more than the name in a path.
    const bool isSorted = screen.contains("_sorted");
    for (const auto& [label, value] : screen) {
        const PathRests inside = isSorted ? PathRests{true, {}} : selected.below(label, atRoot);
        if (const Dictionary* const subScreen = value.asDictionary())
            findSelected(*subScreen, inside, false, found);
        else if (!inside.isEmpty())
            found.emplace(&screen, label);
    }
}

/// Calls `use(dictionary, label)` for each place that shows the value.
template <class Use>
void forEachTarget(const Dictionary& lookup, std::string_view valueKey, Use use) {
    if (const Array* const targets = lookup[valueKey].asArray())
        for (const Value& target : *targets)
            use(*(*target.asDictionary())["dict"].asDictionary(),
                *(*target.asDictionary())["key"].asString());
}

} // namespace

void dropUnselected(Dictionary& lookup, const Value& display, const PathRests& selected) {
    const Dictionary* const root = display.asDictionary();
    if (!root || selected.isWhole)
        return;
    std::set<Target> kept;
    findSelected(*root, selected, true, kept);
    for (const auto& [valueKey, targets] : lookup) {
        Array& all = *targets.asArray();
        const ArrayRef left = makeArray();
        for (const Value& target : all)
            if (kept.contains({(*target.asDictionary())["dict"].asDictionary(),
                               *(*target.asDictionary())["key"].asString()}))
                left->append(target);
        all.clear();
        for (const Value& target : *left)
            all.append(target);
    }
}

void addTargets(const LogCodeParser& parser, const Dictionary& lookup, const std::uint64_t& changes,
                std::vector<ChangingPlace>& places) {
    for (const std::string_view valueKey : valueKeysOf(parser))
        forEachTarget(lookup, valueKey, [&](const Dictionary& screen, const std::string& label) {
            places.push_back({&screen, label, &changes});
        });
}

bool hasTargets(const LogCodeParser& parser, const Dictionary& lookup) {
    bool hasAny = false;
    for (const std::string_view valueKey : valueKeysOf(parser))
        forEachTarget(lookup, valueKey, [&](const Dictionary&, const std::string&) { hasAny = true; });
    return hasAny;
}

} // namespace velmora::C2K
