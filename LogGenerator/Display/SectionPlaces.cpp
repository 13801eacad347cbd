// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Display/SectionPlaces.h"

#include "LogGenerator/Display/WantedLabels.h"

#include <memory>
#include <string_view>

namespace velmora {

namespace {

/// The section of that name whose node it is; null where it is none.
Base* sectionOf(const ClassIndex& index, std::string_view name, const Value& node) {
    Base* const section = index.getClass(name);
    return section && section->isNode(node) ? section : nullptr;
}

void selectIn(const ClassIndex& index, const Value& part, const PathRests& selected, bool atRoot) {
    const Dictionary* const dictionary = part.asDictionary();
    if (!dictionary || selected.isWhole)
        return;
    for (const auto& [key, child] : *dictionary) {
        const PathRests inside = selected.below(key, atRoot);
        if (Base* const section = sectionOf(index, key, child))
            section->setWanted(inside.isWhole
                                   ? nullptr
                                   : std::make_unique<WantedLabels>(inside, child.asArray() != nullptr));
        selectIn(index, child, inside, false);
    }
}

void findIn(const ClassIndex& index, const Value& part, std::vector<ChangingPlace>& places) {
    const Dictionary* const dictionary = part.asDictionary();
    if (!dictionary)
        return;
    for (const auto& [key, child] : *dictionary) {
        if (const Base* const section = sectionOf(index, key, child))
            places.push_back({dictionary, key, &section->changes()});
        findIn(index, child, places);
    }
}

} // namespace

void selectSections(const ClassIndex& index, const Value& display, const PathRests& selected) {
    selectIn(index, display, selected, true);
}

std::vector<ChangingPlace> sectionPlaces(const ClassIndex& index, const Value& display) {
    std::vector<ChangingPlace> places;
    findIn(index, display, places);
    return places;
}

} // namespace velmora
