// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Files/TechnologyNames.h"

#include <algorithm>

namespace velmora {

namespace {

bool isSameInAnyCase(std::string_view a, std::string_view b) {
    const auto lower = [](char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; };
    return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                      [lower](char one, char other) { return lower(one) == lower(other); });
}

/// "LTE" for "Ostrel_LTE", "UTRAN" for "Ostrel_UTRAN2".
std::string_view formWithoutMaker(std::string_view name) {
    name.remove_prefix(name.find('_') + 1);
    return name.substr(0, name.find_last_not_of("0123456789") + 1);
}

} // namespace

const Catalogue* catalogueNamed(std::span<const Catalogue* const> catalogues, std::string_view text) {
    const auto found = std::find_if(catalogues.begin(), catalogues.end(), [text](const Catalogue* each) {
        return isSameInAnyCase(text, each->technology()) ||
               isSameInAnyCase(text, formWithoutMaker(each->technology()));
    });
    return found == catalogues.end() ? nullptr : *found;
}

} // namespace velmora
