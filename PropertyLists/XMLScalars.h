// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "PropertyLists/Value.h"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// The texts of an XML property list's elements as values, and back. Each reading function takes the text of
/// one element, its references replaced, and returns nothing where the text is invalid for the element.

/// Decimal or, after "0x", hexadecimal, with or without sign, white space around it.
struct XMLInteger {
    enum class Status : std::uint8_t { Good, NotANumber, OutOfRange };
    Status status = Status::NotANumber;
    std::int64_t value = 0;
};
[[nodiscard]] XMLInteger integerOfXML(std::string_view text);

/// A decimal number, with or without exponent, or "nan", "inf" or "infinity", with or without sign, white
/// space around it. Numbers outside the range of a double are refused.
[[nodiscard]] std::optional<double> realOfXML(std::string_view text);
/// The shortest decimal text that reads as the same number; "nan", "+infinity", "-infinity".
[[nodiscard]] std::string xmlOfReal(double real);

/// "2026-11-16T05:00:00Z" and nothing else: four digits of year from 0001 on, a day of the calendar, hours to
/// 23, minutes and seconds to 59.
[[nodiscard]] std::optional<Date> dateOfXML(std::string_view text);
/// Precondition: the year is from 0001 to 9999.
[[nodiscard]] std::string xmlOfDate(Date date);

/// Base64, white space anywhere, padded to a multiple of four digits.
[[nodiscard]] std::optional<Data> dataOfXML(std::string_view text);
/// Appends base64 in lines of 76 digits, each after `indent` and followed by a line feed.
void appendXMLOfData(std::string& output, Bytes bytes, std::string_view indent);

/// Text with "&lt;" and its like, or "&#38;" and its like, replaced. References that XML itself does not
/// define are unknown, and so is a "&" that starts none: `unknownReference` is then that text.
struct XMLUnescaped {
    std::optional<std::string> text;
    std::string_view unknownReference;
};
[[nodiscard]] XMLUnescaped unescapedXML(std::string_view text);

} // namespace velmora
