// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/ContentVisitor.h"
#include "Tools/ListSections/DissectorFields.h"
#include "Tools/ListSections/LeafIndex.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Writes what a section or parser describes of the records of one code as a Lua table's entries:
///
///     {row, row, ...},                  a group of fields
///     {list="label", ..., {row}, ...},  a list: its groups, and the lists in its rows
///
/// A row has the numbers of the fields that it sets, where its value lies and what makes it physical; see
/// Resources/wireshark/rows.lua, which reads it.
class ViewText final : public ContentVisitor {
public:
    ViewText(std::string_view technology, std::string_view section, std::uint32_t code,
             const LeafIndex& leaves, DissectorFields& fields)
        : _technology(technology), _section(section), _code(code), _leaves(leaves), _fields(fields) {}

    void subPacket(std::uint8_t id) override { _subPacket = id; }
    void fields(std::span<const Field> fields) override;
    void keyed(const Field& field, const KeyedValue& value) override;
    void beginList(const List& list) override;
    void endList() override;

    [[nodiscard]] const std::string& text() const { return _text; }
    /// The row of a field, as Lua.
    [[nodiscard]] std::string row(const Field& field, const std::string& more = "");

private:
    std::string_view _technology;
    std::string_view _section;
    std::uint32_t _code;
    const LeafIndex& _leaves;
    DissectorFields& _fields;
    std::uint8_t _subPacket = 0;
    std::vector<const List*> _lists;
    std::string _text;
};

} // namespace velmora
