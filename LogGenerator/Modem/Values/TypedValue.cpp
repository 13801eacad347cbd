// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Values/TypedValue.h"

#include "Platform/DateText.h"

#include <cmath>

namespace velmora::LiveModem {

namespace {

constexpr double largestExact = 9007199254740992; // 2^53

std::string hexadecimalDigits(Bytes bytes) {
    constexpr std::string_view digits = "0123456789ABCDEF";
    std::string text;
    for (const std::uint8_t byte : bytes) {
        text += digits[byte >> 4];
        text += digits[byte & 0xF];
    }
    return text;
}

std::string joinedTexts(const Array& values) {
    std::string text;
    for (const Value& value : values) {
        const std::string* const each = value.asString();
        if (each && !each->empty())
            text.append(text.empty() ? "" : ", ").append(*each);
    }
    return text;
}

std::string anyText(const Value& value) {
    if (const std::string* const text = value.asString())
        return *text;
    if (const Array* const values = value.asArray())
        return joinedTexts(*values);
    if (const Date* const date = value.asDate())
        return dateAndTimeText(*date, " ");
    if (const Data* const data = value.asData())
        return hexadecimalDigits(data->bytes());
    return {};
}

} // namespace

std::optional<double> numberOf(const Value& value, const Range& range) {
    double number = 0;
    if (const std::int64_t* const integer = value.asInteger())
        number = static_cast<double>(*integer);
    else if (const double* const real = value.asReal())
        number = *real;
    else
        return std::nullopt;
    // False for what is not a number.
    return range.contains(number) ? std::optional(number) : std::nullopt;
}

std::optional<std::int64_t> wholeNumberOf(const Value& value, const Range& range) {
    const std::optional<double> number = numberOf(value, range);
    if (!number || std::abs(*number) > largestExact || *number != std::trunc(*number))
        return std::nullopt;
    return static_cast<std::int64_t>(*number);
}

std::optional<std::string> textOf(const Value& value) {
    std::string text = anyText(value);
    return text.empty() ? std::nullopt : std::optional(std::move(text));
}

const Array& arrayIn(const Dictionary& dictionary, std::string_view key) {
    static const Array none;
    const Array* const array = dictionary[key].asArray();
    return array ? *array : none;
}

const Dictionary& dictionaryOf(const Value& value) {
    static const Dictionary none;
    const Dictionary* const dictionary = value.asDictionary();
    return dictionary ? *dictionary : none;
}

} // namespace velmora::LiveModem
