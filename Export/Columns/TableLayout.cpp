// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/TableLayout.h"

#include "Export/Columns/ColumnNames.h"

#include <algorithm>

namespace velmora {

namespace {

StoredType storedType(ObservedKind kind) {
    switch (kind) {
    case ObservedKind::Number: return StoredType::Number;
    case ObservedKind::Flag: return StoredType::Boolean;
    default: return StoredType::Text;
    }
}

/// What the catalogue says of the leaf, for readers that have nothing but the file.
void describe(TableLayout& table, const std::string& column, const CatalogueField& leaf) {
    const auto add = [&](std::string_view what, std::string_view value) {
        if (!value.empty())
            table.properties.emplace_back("velmora." + std::string(what) + "." + column, value);
    };
    add("path", leaf.path);
    add("unit", leaf.kind == ObservedKind::Number ? nameOf(leaf.unit) : std::string_view());
    add("role", leaf.role == Role::None ? std::string_view() : nameOf(leaf.role));
    add("identity", leaf.identity == Identity::None ? std::string_view() : nameOf(leaf.identity));
    add("clause", leaf.clause);
    std::string absent; // a line for each
    for (const std::string& text : leaf.absentTexts)
        absent += (absent.empty() ? "" : "\n") + text;
    add("absent", absent);
}

} // namespace

std::size_t TableLayout::add(std::string_view column, StoredType type, ValueMeaning meaning) {
    columns.push_back({{std::string(column), type, meaning, true}, false});
    return columns.size() - 1;
}

std::size_t TableLayout::find(std::string_view column) const {
    const auto found = std::find_if(columns.begin(), columns.end(),
                                    [column](const TableColumn& each) { return each.schema.name == column; });
    return static_cast<std::size_t>(found - columns.begin());
}

std::size_t addPlace(TableLayout& table) {
    const std::size_t first = table.columns.size();
    for (const char* const name : {"latitude", "longitude"}) {
        table.columns.push_back({{name, StoredType::Integer, ValueMeaning::Degrees, true}, true});
        table.properties.emplace_back("velmora.unit." + std::string(name), nameOf(Unit::Degree));
    }
    return first;
}

TableLayout messageTable(std::string name, std::string_view technology) {
    TableLayout table;
    table.name = std::move(name);
    table.properties = {{"velmora.version", std::string(tableVersion)},
                        {"velmora.table", table.name},
                        {"velmora.technology", std::string(technology)}};
    table.columns = {{{"file", StoredType::Text, ValueMeaning::Text, false}, false},
                     {{"message", StoredType::Integer, ValueMeaning::Plain, false}, true},
                     {{"time", StoredType::Integer, ValueMeaning::Timestamp, false}, true},
                     {{"modem_time", StoredType::Integer, ValueMeaning::Timestamp, true}, true},
                     {{"code", StoredType::Integer, ValueMeaning::Plain, true}, false}};
    static_cast<void>(addPlace(table));
    return table;
}

TableLayout listTable(std::string name, std::string_view technology, std::size_t depth) {
    TableLayout table = messageTable(std::move(name), technology);
    table.depth = depth;
    for (std::size_t above = depth; above > 0; --above) {
        std::string column = "row";
        for (std::size_t i = 1; i < above; ++i)
            column.insert(0, "outer_");
        table.add(column, StoredType::Integer);
    }
    table.add("row_key", StoredType::Text, ValueMeaning::Text);
    return table;
}

TechnologyLayout::TechnologyLayout(const Catalogue& catalogue) {
    for (const CatalogueField& leaf : catalogue.fields())
        add(leaf, catalogue.technology());
}

std::size_t TechnologyLayout::tableOf(const std::string& name, std::string_view technology,
                                      std::size_t depth) {
    const auto found = std::find_if(tables.begin(), tables.end(),
                                    [&](const TableLayout& each) { return each.name == name; });
    if (found != tables.end())
        return static_cast<std::size_t>(found - tables.begin());
    tables.push_back(depth > 0 ? listTable(name, technology, depth) : messageTable(name, technology));
    return tables.size() - 1;
}

/// A leaf without a value has no column, and neither has one whose name is taken already, of which a test
/// says that there is none in any catalogue; what is reported of them is among the other fields.
void TechnologyLayout::add(const CatalogueField& leaf, std::string_view technology) {
    LeafColumn& place = leaves.emplace_back();
    if (leaf.kind == ObservedKind::Absent)
        return;
    const ColumnPlace name = placeOf(leaf);
    const std::size_t index = tableOf(name.table, technology, name.depth);
    TableLayout& table = tables[index];
    const bool isEnumeration = leaf.kind == ObservedKind::Enumeration;
    const std::string column = isEnumeration ? name.column + "_text" : name.column;
    const std::string raw = name.column + "_raw";
    if (table.depth != name.depth || table.find(column) != table.columns.size() ||
        (isEnumeration && table.find(raw) != table.columns.size()))
        return;
    place = {index, table.add(column, storedType(leaf.kind),
                              storedType(leaf.kind) == StoredType::Text && leaf.kind != ObservedKind::Binary
                                  ? ValueMeaning::Text
                                  : ValueMeaning::Plain)};
    describe(table, column, leaf);
    if (isEnumeration) {
        table.add(raw, StoredType::Integer);
        describe(table, raw, leaf);
    }
}

} // namespace velmora
