// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Place.h"
#include "LogGenerator/Fields/TextFormat.h"

#include <cstddef>
#include <span>
#include <string_view>

namespace velmora {

/// One row of a record's table: what the value is called, where it lies, how it is shown.
struct Field {
    std::string_view label;
    Place place;
    TextFormat format;
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

/// What a list is called and what its entries are.
struct List {
    enum class Entries : std::uint8_t {
        Rows,    ///< fields, one dictionary an entry
        Values,  ///< one value an entry
        Numbered ///< one value an entry, under a number of its own (a PN offset)
    };

    std::string_view label{}; ///< in the section's dictionary or the row; empty for a section that is a list
    Entries entries = Entries::Rows;
    std::string_view whenEmpty{}; ///< what shows instead of a list without entries; empty: the empty list
};

} // namespace velmora
