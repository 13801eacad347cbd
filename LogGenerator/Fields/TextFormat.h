// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/EnumTexts.h"
#include "LogGenerator/Fields/NumberFormat.h"

#include <cstdint>
#include <string_view>

namespace velmora {

/// How a field's raw value becomes text. Made by the functions below.
struct TextFormat {
    enum class Kind : std::uint8_t { Integer, Real, Enumeration, Flag, Hexadecimal, Text };

    Kind kind = Kind::Text;
    NumberFormat format = "%d";
    double scale = 1;
    double offset = 0;
    const EnumTexts* texts = nullptr;
    std::string_view set;   ///< a flag's text when it is not zero
    std::string_view clear; ///< a flag's text when it is zero
    bool hasSpecial = false;
    std::int64_t specialValue = 0; ///< the raw value that shows `specialText` instead
    std::string_view specialText;
};

/// Raw value times `scale` plus `offset`, in whole numbers, as "%d" or "%u" shows it.
consteval TextFormat integer(NumberFormat format, int offset = 0, int scale = 1) {
    if (format.conversion == 'f')
        throw "integer() with a floating-point conversion";
    TextFormat result;
    result.kind = TextFormat::Kind::Integer;
    result.format = format;
    result.offset = offset;
    result.scale = scale;
    return result;
}

/// Raw value times `scale` plus `offset`, as "%f" shows it.
consteval TextFormat real(NumberFormat format, double scale = 1, double offset = 0) {
    if (format.conversion != 'f')
        throw "real() with an integer conversion";
    TextFormat result;
    result.kind = TextFormat::Kind::Real;
    result.format = format;
    result.scale = scale;
    result.offset = offset;
    return result;
}

/// The enumeration's text.
consteval TextFormat text(const EnumTexts& texts) {
    TextFormat result;
    result.kind = TextFormat::Kind::Enumeration;
    result.texts = &texts;
    return result;
}

/// One text for every value but zero, another for zero.
consteval TextFormat flag(std::string_view set, std::string_view clear) {
    TextFormat result;
    result.kind = TextFormat::Kind::Flag;
    result.set = set;
    result.clear = clear;
    return result;
}

/// The low 32 bits as "0x%06x".
consteval TextFormat hexadecimal() {
    TextFormat result;
    result.kind = TextFormat::Kind::Hexadecimal;
    return result;
}

/// A text that the section supplies.
consteval TextFormat plainText() {
    return {};
}

/// `otherwise`, but for the one raw value that has a text of its own.
consteval TextFormat unless(std::int64_t raw, std::string_view text, TextFormat otherwise) {
    otherwise.hasSpecial = true;
    otherwise.specialValue = raw;
    otherwise.specialText = text;
    return otherwise;
}

/// The text of a raw value, in storage of its own where it is no constant.
class FormattedText {
public:
    FormattedText(const TextFormat& format, std::int64_t raw);
    FormattedText(const FormattedText&) = delete;
    FormattedText& operator=(const FormattedText&) = delete;

    [[nodiscard]] std::string_view view() const { return _view; }

private:
    void formatEnumeration(const EnumTexts& texts, std::uint32_t value);
    void formatHexadecimal(std::uint32_t value);

    std::string_view _view;
    NumberText _number;
};

} // namespace velmora
