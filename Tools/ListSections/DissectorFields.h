// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"

#include <cstddef>
#include <iosfwd>
#include <map>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// The dissector's fields that follow from the catalogues: names, types, units and the texts of enumerations.
/// Others refer to a field by its number, from 1.
class DissectorFields {
public:
    /// The field of a leaf, which is added where there is none; 0 for one that only says why there is no
    /// value.
    std::size_t add(std::string_view technology, const CatalogueField& leaf);
    /// The field that numbers the rows of the list at that node.
    std::size_t addRows(std::string_view technology, std::string_view section, const CatalogueNode& list);

    /// The Lua table of the enumerations' texts, and that of the fields, without their brackets.
    void writeTexts(std::ostream& out) const;
    void writeFields(std::ostream& out) const;

private:
    std::size_t addRow(const std::string& name, std::string row);
    std::size_t textsOf(const CatalogueField& leaf);

    std::vector<std::string> _rows;              ///< as Lua, in the order of their numbers
    std::map<std::string, std::size_t> _numbers; ///< by name
    std::map<std::string, std::size_t> _texts;   ///< numbers of enumerations, by their Lua tables
};

} // namespace velmora
