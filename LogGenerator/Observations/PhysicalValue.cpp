// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/PhysicalValue.h"

#include "LogGenerator/Observations/TextNumber.h"
#include "Platform/DateText.h"
#include "PropertyLists/Value.h"

#include <algorithm>
#include <cmath>

namespace velmora {

namespace {

constexpr std::int64_t largestCode = 999; ///< of a mobile country or network code (3GPP TS 23.003 2.2)

bool areDigits(std::string_view text) {
    return std::all_of(text.begin(), text.end(), [](char c) { return c >= '0' && c <= '9'; });
}

std::string_view withoutBlanks(std::string_view text) {
    const std::size_t first = text.find_first_not_of(' ');
    if (first == std::string_view::npos)
        return {};
    return text.substr(first, text.find_last_not_of(' ') + 1 - first);
}

/// The raw value with the sign that it means.
std::int64_t signedAsMeant(const Field& field, std::int64_t raw) {
    const std::uint8_t width = field.place.width;
    if (field.means.sign == Sign::AsShown || width == 0)
        return raw;
    const std::int64_t range = std::int64_t{1} << width;
    const std::int64_t unsignedRaw = raw & (range - 1);
    return field.means.sign == Sign::Signed && unsignedRaw >= range / 2 ? unsignedRaw - range : unsignedRaw;
}

/// The unit that the leaf's texts show.
Unit textUnit(const CatalogueField& leaf) {
    if (leaf.sources.empty())
        return leaf.unit;
    return unitOfSuffix(leaf.sources.front().field->format.format.suffix).value_or(ShownUnit()).unit;
}

} // namespace

double shownNumber(const Field& field, std::int64_t raw) {
    const TextFormat& format = field.format;
    const std::int64_t meant = signedAsMeant(field, raw);
    switch (format.kind) {
    case TextFormat::Kind::Integer: {
        const std::int64_t shown =
            meant * static_cast<std::int64_t>(format.scale) + static_cast<std::int64_t>(format.offset);
        if (field.means.sign != Sign::AsShown)
            return static_cast<double>(shown);
        // An integer is shown in 32 bits, whatever the record holds.
        return format.format.conversion == 'u' ? static_cast<double>(static_cast<std::uint32_t>(shown))
                                               : static_cast<double>(static_cast<std::int32_t>(shown));
    }
    case TextFormat::Kind::Real: return static_cast<double>(meant) * format.scale + format.offset;
    case TextFormat::Kind::Hexadecimal: return static_cast<double>(static_cast<std::uint32_t>(meant));
    default: return static_cast<double>(meant);
    }
}

std::optional<ShownLine> shownLine(const Field& field) {
    const TextFormat& format = field.format;
    if (field.means.sign != Sign::AsShown || field.place.isComputed())
        return std::nullopt;
    if (format.kind == TextFormat::Kind::Real)
        return ShownLine{format.scale, format.offset};
    if (format.kind != TextFormat::Kind::Integer)
        return std::nullopt;
    // The ends of the line have to fit into what is shown; all are whole numbers, which are exact.
    const ShownLine line{static_cast<double>(static_cast<std::int64_t>(format.scale)),
                         static_cast<double>(static_cast<std::int64_t>(format.offset))};
    const std::int64_t range = std::int64_t{1} << field.place.width;
    const std::int64_t least = field.place.isSigned ? -range / 2 : 0;
    for (const std::int64_t end : {least, least + range - 1})
        if (shownNumber(field, end) != static_cast<double>(end) * line.scale + line.offset)
            return std::nullopt;
    return line;
}

std::string_view codeText(const Field& field, std::int64_t number, TextArena& texts) {
    if (number < 0 || number > largestCode)
        return {};
    std::string& digits = texts.add() = std::to_string(number);
    if (digits.size() < field.means.digits)
        digits.insert(0, field.means.digits - digits.size(), '0');
    return digits;
}

void setCode(const Field& field, std::string_view text, Observation& observation) {
    const std::string_view digits = withoutBlanks(text);
    const bool isCode = digits.size() >= field.means.digits && areDigits(digits);
    observation.kind = isCode ? ObservedKind::Text : ObservedKind::Absent;
    observation.words = isCode ? digits : std::string_view();
}

void setSupplied(const Value& value, TextArena& texts, Observation& observation) {
    if (const std::string* const text = value.asString()) {
        observation.given = texts.copy(*text);
        if (!observation.leaf->isReadFromText) {
            observation.kind = ObservedKind::Text;
            observation.words = observation.given;
        } else if (const std::optional<TextNumber> number = readTextNumber(*text);
                   number && number->unit == textUnit(*observation.leaf)) {
            observation.kind = ObservedKind::Number;
            observation.number = number->value;
        }
    } else if (const std::int64_t* const integer = value.asInteger()) {
        observation.kind = ObservedKind::Number;
        observation.number = static_cast<double>(*integer);
        observation.given = texts.add() = std::to_string(*integer);
    } else if (const double* const number = value.asReal()) {
        observation.given = texts.add() = std::to_string(*number);
        if (!std::isfinite(*number))
            return; // absent
        observation.kind = ObservedKind::Number;
        observation.number = *number;
    } else if (const bool* const flag = value.asBoolean()) {
        observation.kind = ObservedKind::Flag;
        observation.raw = *flag ? 1 : 0;
        observation.given = *flag ? "true" : "false";
    } else if (const Date* const date = value.asDate()) {
        observation.kind = ObservedKind::Text;
        observation.given = texts.add() = dateAndTimeText(*date, " ");
        observation.words = observation.given;
    } else if (const Data* const data = value.asData()) {
        observation.kind = ObservedKind::Binary;
        observation.bytes = data->bytes();
    }
}

} // namespace velmora
