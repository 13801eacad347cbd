// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/FieldVisitor.h"
#include "LogGenerator/Observations/ContentVisitor.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

namespace velmora::C2K {

/// What a field that is not valid shows.
inline constexpr std::string_view notValid = "N/A";

/// When a field is valid. One that is not valid is not read.
enum class Validity : std::uint8_t { Always, WhileConnected };

/// One row of a parser's table, in publishing order. The field's label is a value key.
struct ValueField {
    constexpr ValueField(std::string_view key, const Place& place, const TextFormat& format,
                         Validity when = Validity::Always, const Meaning& means = {})
        : field{key, place, format, means}, validity(when) {
        if (when != Validity::Always)
            field.means.absent = notValid;
    }
    constexpr ValueField(std::string_view key, const Place& place, const TextFormat& format,
                         const Meaning& means)
        : ValueField(key, place, format, Validity::Always, means) {}

    [[nodiscard]] constexpr bool isValid(bool connected) const {
        return connected || validity == Validity::Always;
    }

    Field field;
    Validity validity;
};

/// The length up to which the fields are read.
constexpr std::size_t endOf(std::span<const ValueField> fields, bool connected) {
    std::size_t end = 0;
    for (const ValueField& row : fields)
        if (row.isValid(connected))
            end = std::max(end, row.field.place.end());
    return end;
}

/// Names every field, in table order. Precondition: the record (or the rest of it, for a sub-packet's fields)
/// reaches to endOf(fields, connected).
inline void visitFields(std::span<const ValueField> fields, const Record& record, bool connected,
                        FieldVisitor& visitor) {
    for (const ValueField& row : fields) {
        if (row.isValid(connected))
            visitor.number(row.field, row.field.place.read(record));
        else
            visitor.text(row.field, notValid);
    }
}

inline void describeFields(std::span<const ValueField> fields, ContentVisitor& visitor) {
    for (const ValueField& row : fields)
        visitor.field(row.field);
}

} // namespace velmora::C2K
