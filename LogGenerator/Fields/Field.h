// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/NumberFormat.h"
#include "LogMessages/Record.h"
#include "PropertyLists/Value.h"

#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

namespace velmora {

/// Where a field lies in its record or entry, and how its bits are read.
struct Where {
    std::uint16_t offset = 0; ///< of the byte that holds the lowest bit (of the first byte, big-endian)
    std::uint8_t bit = 0;     ///< the lowest bit's number in that byte
    std::uint8_t width = 8;   ///< in bits
    bool isSigned = false;    ///< two's complement; whole bytes only
    bool isBigEndian = false; ///< 16-bit only

    /// The first offset behind the field.
    [[nodiscard]] constexpr std::size_t end() const { return offset + (bit + width + 7u) / 8u; }
    [[nodiscard]] std::int64_t read(const Record& record) const;
};

consteval Where u8At(std::uint16_t offset) {
    return {offset, 0, 8, false, false};
}
consteval Where i8At(std::uint16_t offset) {
    return {offset, 0, 8, true, false};
}
consteval Where u16At(std::uint16_t offset) {
    return {offset, 0, 16, false, false};
}
consteval Where i16At(std::uint16_t offset) {
    return {offset, 0, 16, true, false};
}
consteval Where u32At(std::uint16_t offset) {
    return {offset, 0, 32, false, false};
}
consteval Where i32At(std::uint16_t offset) {
    return {offset, 0, 32, true, false};
}
consteval Where u16BigEndianAt(std::uint16_t offset) {
    return {offset, 0, 16, false, true};
}
consteval Where bitsAt(std::uint16_t byte, std::uint8_t bit, std::uint8_t width) {
    if (bit > 7 || width < 1 || bit + width > 32 || width > 25)
        throw "a bit field that the record cannot read";
    return {byte, bit, width, false, false};
}

/// One value of an enumeration and its text.
struct EnumText {
    std::uint32_t value;
    std::string_view text;
};

/// An enumeration's texts in ascending order of value, holes left out, and what every other value shows.
struct EnumTexts {
    std::span<const EnumText> rows;
    std::string_view fallback;

    template <std::size_t N>
    consteval EnumTexts(const EnumText (&table)[N], std::string_view other) : rows(table), fallback(other) {
        for (std::size_t i = 1; i < N; ++i)
            if (table[i].value <= table[i - 1].value)
                throw "an enumeration table that does not ascend";
    }

    [[nodiscard]] constexpr std::string_view operator[](std::uint32_t value) const {
        for (const EnumText& row : rows)
            if (row.value == value)
                return row.text;
        return fallback;
    }
};

/// How a field's raw value becomes text. Made by the functions below.
struct Show {
    enum class Kind : std::uint8_t { Integer, Real, Text, Flag };

    Kind kind = Kind::Integer;
    NumberFormat format = "%d";
    double scale = 1;
    double offset = 0;
    const EnumTexts* texts = nullptr;
    std::string_view set;   ///< a flag's text when it is not zero
    std::string_view clear; ///< a flag's text when it is zero
    bool hasException = false;
    std::int64_t exception = 0; ///< the raw value that shows `exceptionText` instead
    std::string_view exceptionText;
};

/// Raw value times `scale` plus `offset`, in whole numbers, as "%d" or "%u" shows it.
consteval Show integer(NumberFormat format, int offset = 0, int scale = 1) {
    if (format.conversion == 'f')
        throw "integer() with a floating-point conversion";
    Show show;
    show.format = format;
    show.offset = offset;
    show.scale = scale;
    return show;
}

/// Raw value times `scale` plus `offset`, as "%f" shows it.
consteval Show real(NumberFormat format, double scale = 1, double offset = 0) {
    if (format.conversion != 'f')
        throw "real() with an integer conversion";
    Show show;
    show.kind = Show::Kind::Real;
    show.format = format;
    show.scale = scale;
    show.offset = offset;
    return show;
}

/// The enumeration's text.
consteval Show text(const EnumTexts& texts) {
    Show show;
    show.kind = Show::Kind::Text;
    show.texts = &texts;
    return show;
}

/// One text for every value but zero, another for zero.
consteval Show flag(std::string_view set, std::string_view clear) {
    Show show;
    show.kind = Show::Kind::Flag;
    show.set = set;
    show.clear = clear;
    return show;
}

/// `otherwise`, but for the one raw value that has a text of its own.
consteval Show unless(std::int64_t raw, std::string_view text, Show otherwise) {
    otherwise.hasException = true;
    otherwise.exception = raw;
    otherwise.exceptionText = text;
    return otherwise;
}

/// One row of a record's table: what the value is called, where it lies, how it is shown.
struct Field {
    std::string_view label;
    Where where;
    Show show;
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
        if (fields[i].where.end() > minimumLength)
            throw "a field that ends behind the minimum length";
        for (std::size_t j = 0; j < i; ++j)
            if (fields[j].label == fields[i].label)
                throw "two fields of one label";
    }
    return {minimumLength, fields};
}

/// Calls `put(text)` with what a raw value reads.
template <class Put>
void withText(const Show& show, std::int64_t raw, Put put) {
    if (show.hasException && raw == show.exception) {
        put(show.exceptionText);
        return;
    }
    switch (show.kind) {
    case Show::Kind::Integer: {
        const auto value =
            raw * static_cast<std::int64_t>(show.scale) + static_cast<std::int64_t>(show.offset);
        put(NumberText(show.format, value).text());
        break;
    }
    case Show::Kind::Real:
        put(NumberText(show.format, static_cast<double>(raw) * show.scale + show.offset).text());
        break;
    case Show::Kind::Text: put((*show.texts)[static_cast<std::uint32_t>(raw)]); break;
    case Show::Kind::Flag: put(raw != 0 ? show.set : show.clear); break;
    }
}

/// Writes one raw value under its label.
void writeValue(Dictionary& node, std::string_view label, const Show& show, std::int64_t raw);

/// Writes every field, in table order, under its label. Precondition: the record has the minimum length.
void writeFields(Dictionary& node, const Record& record, const Layout& layout);

/// The same, once somebody looks at the node (see Writing). The layout must be a constant.
void writeFieldsLater(Dictionary& node, const Record& record, const Layout& layout);

} // namespace velmora
