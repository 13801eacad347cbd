// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"
#include "LogMessages/Record.h"

#include <cstddef>
#include <cstdint>
#include <string_view>

namespace velmora {

class Value;

/// What a decode function names the fields of a record to, in the order in which the display shows them. The
/// visitor turns them into the display's texts or a tool's values; a decode function has no other effect and
/// may be called any number of times for the same record.
///
/// Fields, lists and formats are constants. Texts and values are valid during the call only.
class FieldVisitor {
public:
    virtual ~FieldVisitor() = default;

    /// All rows of a table, in table order. Precondition: the record has the layout's minimum length.
    virtual void fields(const Record& record, const Layout& layout) = 0;
    /// A field by its raw value, which no table reads.
    virtual void number(const Field& field, std::int64_t raw) = 0;
    /// A field whose value is a real number, which its format shows without scale and offset.
    virtual void real(const Field& field, double value) = 0;
    /// A field that is a text, or shows one instead of its value.
    virtual void text(const Field& field, std::string_view text) = 0;
    /// A field whose value the telephony service supplies ready to be shown, of whatever kind.
    virtual void supplied(const Field& field, const Value& value) = 0;
    /// The field of an earlier record is not valid any more.
    virtual void removed(std::string_view label) = 0;

    /// What follows up to `endWhole` is all that the section's dictionary shows, in this order: what is there
    /// of earlier records and is not named again is gone. Each label is named once. The default is for
    /// visitors that no section names its fields to.
    virtual void beginWhole() {}
    virtual void endWhole() {}

    /// A list begins, which replaces an earlier one; its entries follow. Lists nest in rows.
    virtual void beginList(const List& list) = 0;
    /// A row begins; its fields follow. `List::Entries::Rows` only.
    virtual void beginRow() = 0;
    virtual void endRow() = 0;
    /// The next value of a list has this number of its own and this index in the record.
    /// `List::Entries::Numbered` only.
    virtual void entryNumber(std::size_t index, std::uint16_t number) = 0;
    virtual void endList() = 0;

    /// A list of one row for each complete entry, by a table. The default names them one by one.
    virtual void rows(const List& list, const CountedList& entries, const Layout& layout) {
        beginList(list);
        for (std::size_t i = 0, count = entries.completeCount(); i < count; ++i) {
            beginRow();
            fields(entries[i], layout);
            endRow();
        }
        endList();
    }
};

} // namespace velmora
