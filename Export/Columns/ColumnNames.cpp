// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/ColumnNames.h"

#include <algorithm>
#include <vector>

namespace velmora {

namespace {

std::string_view endingOf(Unit unit) {
    switch (unit) {
    case Unit::None: return "";
    case Unit::DBm: return "_dbm";
    case Unit::DB: return "_db";
    case Unit::Percent: return "_percent";
    case Unit::KilobitPerSecond: return "_kbit_s";
    case Unit::Second: return "_s";
    case Unit::Megahertz: return "_mhz";
    case Unit::Byte: return "_byte";
    case Unit::Degree: return "_degree";
    case Unit::Metre: return "_m";
    }
    return "";
}

std::string_view endingOf(const CatalogueField& leaf) {
    switch (leaf.kind) {
    case ObservedKind::Number: return endingOf(leaf.unit);
    case ObservedKind::Text: return "_text";
    case ObservedKind::Flag: return "_flag";
    case ObservedKind::Binary: return "_data";
    case ObservedKind::Enumeration:
    case ObservedKind::Absent: break;
    }
    return "";
}

using Labels = std::vector<std::string_view>;

Labels labelsOf(const CatalogueField& leaf) {
    Labels labels;
    for (const CatalogueNode* node = leaf.node; node->parent(); node = node->parent())
        labels.emplace_back(node->name());
    std::reverse(labels.begin(), labels.end());
    return labels;
}

/// The rows of lists have no name of their own.
std::string joined(Labels::const_iterator begin, Labels::const_iterator end) {
    std::string name;
    for (; begin != end; ++begin) {
        if (*begin == "*")
            continue;
        if (!name.empty())
            name += '_';
        name += columnName(*begin);
    }
    return name;
}

/// How many labels lead to the table: to a list's rows, to the section, or else to what is at the top.
std::ptrdiff_t tableLabels(const Labels& labels, const CatalogueField& leaf) {
    const auto row = std::find(labels.rbegin(), labels.rend(), "*");
    if (row != labels.rend())
        return labels.rend() - row;
    const auto section = std::find(labels.begin(), labels.end(), leaf.section);
    if (section != labels.end())
        return section - labels.begin() + 1;
    return 1;
}

} // namespace

std::string columnName(std::string_view label) {
    std::string name;
    for (const char c : label) {
        if ((c >= 'a' && c <= 'z') || (c >= '0' && c <= '9'))
            name += c;
        else if (c >= 'A' && c <= 'Z')
            name += static_cast<char>(c - 'A' + 'a');
        else if (!name.empty() && name.back() != '_')
            name += '_';
    }
    while (name.ends_with('_'))
        name.pop_back();
    return name;
}

ColumnPlace placeOf(const CatalogueField& leaf) {
    const Labels labels = labelsOf(leaf);
    const auto depth = static_cast<std::size_t>(std::count(labels.begin(), labels.end(), "*"));
    const auto table = labels.begin() + tableLabels(labels, leaf);
    ColumnPlace place{joined(labels.begin(), table), joined(table, labels.end()), depth};
    // What is a text or a list of values itself has the name of its last label.
    if (place.column.empty()) {
        const auto last =
            std::find_if(labels.rbegin(), labels.rend(), [](std::string_view label) { return label != "*"; });
        place.column = last == labels.rend() ? "value" : columnName(*last);
    }
    place.column += endingOf(leaf);
    return place;
}

} // namespace velmora
