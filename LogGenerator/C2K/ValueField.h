// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/NumberedTexts.h"
#include "LogGenerator/Fields/Field.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

namespace velmora::C2K {

class Publisher;

/// How a field's raw value becomes text: as the sections' fields do, by a table that shows unknown values, or
/// as six hexadecimal digits.
struct Shown {
    enum class Kind : std::uint8_t { Plain, Texts, Hexadecimal };

    consteval Shown(const Show& plain) : show(plain) {}
    consteval Shown(const NumberedTexts& table) : kind(Kind::Texts), texts(&table) {}

    Kind kind = Kind::Plain;
    Show show;
    const NumberedTexts* texts = nullptr;
};

/// As "0x%06x".
consteval Shown hexadecimal() {
    Shown shown{Show{}};
    shown.kind = Shown::Kind::Hexadecimal;
    return shown;
}

/// When a field means something. One that does not is not read and shows "N/A".
enum class When : std::uint8_t { Always, Connected };

/// One row of a parser's table, in publishing order.
struct ValueField {
    std::string_view key; ///< value key
    Where where;
    Shown shown;
    When when = When::Always;
};

/// The length up to which the fields are read.
constexpr std::size_t endOf(std::span<const ValueField> fields, bool connected) {
    std::size_t end = 0;
    for (const ValueField& field : fields)
        if (connected || field.when == When::Always)
            end = std::max(end, field.where.end());
    return end;
}

/// Publishes every field, in table order. The fields must be a constant. Precondition: the record (or the
/// rest of it, for a sub-packet's fields) reaches to endOf(fields, connected).
void publishFields(const Publisher& publisher, const Record& record, std::span<const ValueField> fields,
                   bool connected);

} // namespace velmora::C2K
