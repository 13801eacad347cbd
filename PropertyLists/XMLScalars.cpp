// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/XMLScalars.h"

#include "Platform/Base64.h"
#include "Platform/DateText.h"
#include "PropertyLists/PropertyListDate.h"
#include "PropertyLists/XMLText.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <limits>
#include <utility>
#include <vector>

namespace velmora {

namespace {

std::string_view trimmed(std::string_view text) {
    while (!text.empty() && isXMLSpace(text.front()))
        text.remove_prefix(1);
    while (!text.empty() && isXMLSpace(text.back()))
        text.remove_suffix(1);
    return text;
}

/// Takes a sign off the text's front; whether it was a minus.
bool parseSign(std::string_view& text) {
    if (text.empty() || (text.front() != '-' && text.front() != '+'))
        return false;
    const bool negative = text.front() == '-';
    text.remove_prefix(1);
    return negative;
}

bool isDigit(char character) {
    return character >= '0' && character <= '9';
}

/// A number that all the text is, without sign.
std::optional<char32_t> characterOf(std::string_view digits, int base) {
    std::uint32_t number = 0;
    const auto [end, error] = std::from_chars(digits.data(), digits.data() + digits.size(), number, base);
    if (error != std::errc() || end != digits.data() + digits.size() || !isXMLCharacter(number))
        return std::nullopt;
    return number;
}

/// The character that a reference's name (what is between "&" and ";") means.
std::optional<char32_t> referenced(std::string_view name) {
    if (name == "lt")
        return U'<';
    if (name == "gt")
        return U'>';
    if (name == "amp")
        return U'&';
    if (name == "quot")
        return U'"';
    if (name == "apos")
        return U'\'';
    if (name.starts_with("#x"))
        return characterOf(name.substr(2), 16);
    if (name.starts_with("#"))
        return characterOf(name.substr(1), 10);
    return std::nullopt;
}

} // namespace

XMLInteger integerOfXML(std::string_view text) {
    text = trimmed(text);
    const bool negative = parseSign(text);
    int base = 10;
    if (text.starts_with("0x") || text.starts_with("0X")) {
        text.remove_prefix(2);
        base = 16;
    }
    std::uint64_t magnitude = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), magnitude, base);
    if (error == std::errc::invalid_argument || end != text.data() + text.size())
        return {XMLInteger::Status::NotANumber, 0};
    constexpr auto largest = static_cast<std::uint64_t>(std::numeric_limits<std::int64_t>::max());
    if (error != std::errc() || magnitude > largest + (negative ? 1 : 0))
        return {XMLInteger::Status::OutOfRange, 0};
    // Negated without sign, since the magnitude of the least number has no positive counterpart.
    return {XMLInteger::Status::Good, static_cast<std::int64_t>(negative ? 0 - magnitude : magnitude)};
}

std::optional<double> realOfXML(std::string_view text) {
    text = trimmed(text);
    const bool negative = parseSign(text);
    double magnitude = 0;
    if (text == "nan") {
        magnitude = std::numeric_limits<double>::quiet_NaN();
    } else if (text == "inf" || text == "infinity") {
        magnitude = std::numeric_limits<double>::infinity();
    } else {
        if (text.empty() || !(isDigit(text.front()) || text.front() == '.'))
            return std::nullopt;
        const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), magnitude);
        if (error != std::errc() || end != text.data() + text.size())
            return std::nullopt;
    }
    return negative ? -magnitude : magnitude;
}

std::string xmlOfReal(double real) {
    if (std::isnan(real))
        return "nan";
    if (std::isinf(real))
        return real > 0 ? "+infinity" : "-infinity";
    char text[32];
    const auto result = std::to_chars(text, text + sizeof text, real);
    return std::string(text, result.ptr);
}

std::optional<Date> dateOfXML(std::string_view text) {
    if (!text.ends_with('Z'))
        return std::nullopt;
    const std::optional<Date> date = momentOfText(text.substr(0, text.size() - 1), 'T');
    return date && isPropertyListDate(*date) ? date : std::nullopt;
}

std::string xmlOfDate(Date date) {
    return isoText(date);
}

std::optional<Data> dataOfXML(std::string_view text) {
    std::optional<std::vector<std::uint8_t>> bytes = bytesOfBase64(text);
    return bytes ? std::optional(Data(*std::move(bytes))) : std::nullopt;
}

void appendXMLOfData(std::string& output, Bytes bytes, std::string_view indent) {
    constexpr std::size_t bytesALine = 57;
    while (!bytes.empty()) {
        const Bytes line = bytes.first(std::min(bytesALine, bytes.size()));
        bytes = bytes.subspan(line.size());
        output += indent;
        const std::size_t begin = output.size();
        output.resize(begin + base64Size(line.size()));
        putBase64(output.data() + begin, line);
        output += '\n';
    }
}

XMLUnescaped unescapedXML(std::string_view text) {
    std::string result;
    result.reserve(text.size());
    while (!text.empty()) {
        const std::size_t start = text.find('&');
        result += text.substr(0, start);
        if (start == std::string_view::npos)
            break;
        text.remove_prefix(start);
        // The longest name with a meaning has eight characters ("#x10FFFF"); leading zeros are let pass.
        constexpr std::size_t longest = 32;
        const std::size_t end = text.substr(0, longest).find(';');
        const auto character =
            end == std::string_view::npos ? std::nullopt : referenced(text.substr(1, end - 1));
        if (!character)
            return {std::nullopt, text.substr(0, end == std::string_view::npos ? 1 : end + 1)};
        appendUTF8(result, *character);
        text.remove_prefix(end + 1);
    }
    return {std::move(result), {}};
}

} // namespace velmora
