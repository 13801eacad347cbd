// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/ListSections/DissectorFields.h"

#include "Tools/ListSections/FieldName.h"
#include "Tools/ListSections/LuaText.h"

#include <algorithm>
#include <cmath>
#include <ostream>
#include <stdexcept>

namespace velmora {

namespace {

bool isWhole(const Field& field) {
    const double scale = field.format.scale * physicalScale(field);
    return field.format.kind != TextFormat::Kind::Real && std::trunc(scale) == scale &&
           std::trunc(field.means.offset) == field.means.offset;
}

/// The letter of the type by which the dissector makes the field of a number.
char numberType(const CatalogueField& leaf) {
    const auto all = [&leaf](auto isSo) {
        return std::all_of(leaf.sources.begin(), leaf.sources.end(), [&isSo](const CatalogueSource& source) {
            return kindOf(*source.field) != ObservedKind::Number || isSo(*source.field);
        });
    };
    if (!all(isWhole))
        return 'd';
    const auto isHexadecimal = [](const Field& field) {
        return field.format.kind == TextFormat::Kind::Hexadecimal;
    };
    if (all(isHexadecimal))
        return 'x';
    return all([](const Field& field) { return field.format.format.conversion == 'u'; }) ? 'u' : 'i';
}

/// The letter of a leaf's type; 0 for none.
char typeOf(const CatalogueField& leaf) {
    switch (leaf.kind) {
    case ObservedKind::Number: return numberType(leaf);
    case ObservedKind::Enumeration: return 'e';
    case ObservedKind::Flag: return 'f';
    case ObservedKind::Text: return 's';
    case ObservedKind::Binary: return 'b';
    case ObservedKind::Absent: break;
    }
    return 0;
}

} // namespace

std::size_t DissectorFields::addRow(const std::string& name, std::string row) {
    const auto [found, isNew] = _numbers.try_emplace(name, _rows.size() + 1);
    if (isNew)
        _rows.push_back(std::move(row));
    else if (_rows[found->second - 1] != row)
        throw std::runtime_error("two fields are called " + name);
    return found->second;
}

std::size_t DissectorFields::textsOf(const CatalogueField& leaf) {
    std::map<std::uint32_t, std::string_view> texts;
    for (const CatalogueSource& source : leaf.sources)
        if (const TextFormat& format = source.field->format; format.kind == TextFormat::Kind::Enumeration)
            for (const EnumText& row : format.texts->rows)
                texts.try_emplace(row.value, row.text);
    std::string table = "{";
    for (const auto& [value, text] : texts)
        table += "[" + std::to_string(static_cast<std::int32_t>(value)) + "]=" + luaString(text) + ",";
    return _texts.try_emplace(table + "}", _texts.size() + 1).first->second;
}

std::size_t DissectorFields::add(std::string_view technology, const CatalogueField& leaf) {
    const char type = typeOf(leaf);
    if (type == 0)
        return 0;
    const std::string name = fieldName(technology, leaf.section, *leaf.node);
    const CatalogueNode* shown = leaf.node; // a row that is a value has the name of the list
    while (shown->isRow())
        shown = shown->parent();
    std::string row = "{" + luaString(name) + "," + luaString(shown->name()) + ",\"" + type + "\"";
    if (type == 'e') {
        row += "," + std::to_string(textsOf(leaf));
    } else if (type == 'f') {
        const TextFormat& format = leaf.sources.front().field->format;
        row += "," + luaString(format.set) + "," + luaString(format.clear);
    } else if (leaf.unit != Unit::None) {
        row += "," + luaString(" " + std::string(nameOf(leaf.unit)));
    }
    return addRow(name, row + "}");
}

std::size_t DissectorFields::addRows(std::string_view technology, std::string_view section,
                                     const CatalogueNode& list) {
    const std::string name = fieldName(technology, section, list) + ".row";
    return addRow(name, "{" + luaString(name) + "," + luaString(list.name()) + ",\"r\"}");
}

void DissectorFields::writeTexts(std::ostream& out) const {
    std::vector<std::string_view> tables(_texts.size());
    for (const auto& [table, number] : _texts)
        tables[number - 1] = table;
    for (const std::string_view table : tables)
        out << "    " << table << ",\n";
}

void DissectorFields::writeFields(std::ostream& out) const {
    for (const std::string& row : _rows)
        out << "    " << row << ",\n";
}

} // namespace velmora
