// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Meaning.h"
#include "LogGenerator/Fields/Place.h"
#include "LogGenerator/Fields/TextFormat.h"

#include <cstddef>
#include <span>
#include <string_view>

namespace velmora {

/// One row of a record's table: what the value is called, where it lies, how it is shown, what it means.
struct Field {
    std::string_view label;
    Place place;
    TextFormat format;
    Meaning means{};
};

/// A record's or entry's table and the length below which none of it is read.
struct Layout {
    std::size_t minimumLength;
    std::span<const Field> fields;
};

/// A layout whose fields all lie inside the minimum length under labels of their own; any other does not
/// compile.
template <std::size_t N>
consteval Layout layout(std::size_t minimumLength, const Field (&fields)[N]) {
    for (std::size_t i = 0; i < N; ++i) {
        if (fields[i].place.isComputed())
            throw "a computed field in a table that is read";
        if (fields[i].place.end() > minimumLength)
            throw "a field that ends past the minimum length";
        for (std::size_t j = 0; j < i; ++j)
            if (fields[j].label == fields[i].label)
                throw "two fields of one label";
    }
    return {minimumLength, fields};
}

struct List;

/// Something that a record may show, for the catalogue: fields or a list. What it refers to must be a
/// constant.
struct Content {
    constexpr Content(const Field& field) : fields(&field, 1) {}
    constexpr Content(const Layout& layout) : fields(layout.fields) {}
    template <std::size_t N>
    constexpr Content(const Field (&each)[N]) : fields(each) {}
    constexpr Content(const List& shown) : list(&shown) {}

    std::span<const Field> fields{};
    const List* list = nullptr; ///< null where it is fields
};

/// What a list is called, what its entries are, and what identifies one of them.
struct List {
    enum class Entries : std::uint8_t {
        Rows,    ///< fields, one dictionary an entry
        Values,  ///< one value an entry
        Numbered ///< one value an entry, under a number of its own (a PN offset)
    };

    std::string_view label{}; ///< in the section's dictionary or the row; empty for a section that is a list
    Entries entries = Entries::Rows;
    std::string_view whenEmpty{}; ///< what shows instead of a list without entries; empty: the empty list
    std::span<const Content> contents{}; ///< what an entry may show
    /// The labels of the fields that identify an entry from record to record, as a channel and a physical
    /// cell do; none where only the index does.
    std::span<const std::string_view> keys{};
    bool isOpen = false; ///< entries may show more than the contents: they name it themselves
};

} // namespace velmora
