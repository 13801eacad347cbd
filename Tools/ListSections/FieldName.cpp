// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/ListSections/FieldName.h"

#include "LogGenerator/Observations/Catalogue.h"

namespace velmora {

namespace {

constexpr std::string_view maker = "Ostrel_";
constexpr std::string_view digits = "0123456789";

} // namespace

std::string snakeCase(std::string_view text) {
    std::string name;
    bool isBetween = false;
    for (const char c : text) {
        const char lower = c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
        if (!(lower >= 'a' && lower <= 'z') && digits.find(lower) == std::string_view::npos) {
            isBetween = true;
            continue;
        }
        if (isBetween && !name.empty())
            name += '_';
        isBetween = false;
        name += lower;
    }
    return name;
}

std::string fieldPrefix(std::string_view technology) {
    if (technology.starts_with(maker))
        technology.remove_prefix(maker.size());
    technology = technology.substr(0, technology.find_last_not_of(digits) + 1);
    return "velmora." + snakeCase(technology);
}

std::string fieldName(std::string_view technology, std::string_view section, const CatalogueNode& node) {
    std::string name;
    for (const CatalogueNode* each = &node; each->parent(); each = each->parent()) {
        if (const std::string part = snakeCase(each->name()); !part.empty())
            name.insert(0, "." + part);
        if (!section.empty() && each->name() == section)
            break; // the groups above are the display's
    }
    return fieldPrefix(technology) + name;
}

} // namespace velmora
