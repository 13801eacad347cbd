// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/Pseudonyms/DigitPseudonyms.h"

#include "Export/Masking/Pseudonyms/NumberPseudonyms.h"

#include <algorithm>
#include <vector>

namespace velmora {

namespace {

constexpr std::string_view hexadecimalDigits = "0123456789abcdef";

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

std::string digitsOf(std::string_view text) {
    std::string digits;
    std::copy_if(text.begin(), text.end(), std::back_inserter(digits), isDigit);
    return digits;
}

unsigned numberOf(std::string_view digits) {
    unsigned number = 0;
    for (const char digit : digits)
        number = number * 10 + static_cast<unsigned>(digit - '0');
    return number;
}

/// The text with these digits, of which there are as many, in place of its own.
std::string withDigits(std::string_view text, std::string_view digits) {
    std::string result(text);
    auto next = digits.begin();
    for (char& c : result)
        if (isDigit(c))
            c = *next++;
    return result;
}

void putNumber(std::string& text, std::size_t offset, std::size_t count, unsigned number) {
    for (std::size_t i = count; i > 0; --i, number /= 10)
        text[offset + i - 1] = static_cast<char>('0' + number % 10);
}

/// Whether it has the major industry identifier of telecommunications, which all have.
bool startsAsTelecommunications(std::string_view text) {
    return digitsOf(text).starts_with("89");
}

} // namespace

char checkDigitOf(std::string_view digits) {
    unsigned sum = 0;
    for (std::size_t i = 0; i < digits.size(); ++i) {
        unsigned digit = static_cast<unsigned>(digits[digits.size() - 1 - i] - '0');
        if (i % 2 == 0)
            digit = digit * 2 > 9 ? digit * 2 - 9 : digit * 2;
        sum += digit;
    }
    return static_cast<char>('0' + (10 - sum % 10) % 10);
}

std::size_t networkLengthOf(std::string_view imsi) {
    const unsigned country = imsi.size() < 3 ? 0 : numberOf(imsi.substr(0, 3));
    return country == 302 || (country >= 310 && country <= 316) ? 6 : 5;
}

std::string DigitPseudonyms::computed(PseudonymKind kind, std::string_view digits, std::size_t kept) const {
    std::string result(digits);
    if (digits.size() <= kept)
        return result;
    std::vector<std::uint8_t> values;
    for (const char digit : digits.substr(kept))
        values.push_back(static_cast<std::uint8_t>(digit - '0'));
    permute(_hash, kind, values, 10);
    std::transform(values.begin(), values.end(), result.begin() + static_cast<std::ptrdiff_t>(kept),
                   [](std::uint8_t value) { return static_cast<char>('0' + value); });
    return result;
}

std::string DigitPseudonyms::replaced(PseudonymKind kind, std::string_view text, std::size_t kept) {
    const std::string digits = digitsOf(text);
    std::string key(1, static_cast<char>(kind));
    key += digits;
    auto cached = _cache.find(key);
    if (cached == _cache.end()) {
        if (_cache.size() >= mostCached)
            _cache.clear();
        std::string masked;
        const bool isChecked =
            (kind == PseudonymKind::ICCID && (digits.size() == 19 || digits.size() == 20)) ||
            (kind == PseudonymKind::Equipment && digits.size() == 15);
        if (isChecked) {
            masked = computed(kind, std::string_view(digits).substr(0, digits.size() - 1), kept);
            masked += checkDigitOf(masked);
        } else if (kind == PseudonymKind::EID && digits.size() == 32) {
            masked = computed(kind, std::string_view(digits).substr(0, 30), kept) + "00";
            // The number with its two last digits is 1 modulo 97 (ISO/IEC 7064, MOD 97-10).
            unsigned rest = 0;
            for (const char digit : masked)
                rest = (rest * 10 + static_cast<unsigned>(digit - '0')) % 97;
            putNumber(masked, 30, 2, 98 - rest);
        } else {
            masked = computed(kind, digits, kept);
        }
        if (kind == PseudonymKind::IMSI && _networks)
            maskNetwork(masked);
        cached = _cache.emplace(std::move(key), std::move(masked)).first;
    }
    return withDigits(text, cached->second);
}

void DigitPseudonyms::maskNetwork(std::string& digits) const {
    const std::size_t length = networkLengthOf(digits);
    if (digits.size() < length)
        return;
    putNumber(digits, 3, length - 3,
              _networks->networkCode(numberOf(std::string_view(digits).substr(3, length - 3))));
    putNumber(digits, 0, 3, _networks->countryCode(numberOf(std::string_view(digits).substr(0, 3))));
}

std::string DigitPseudonyms::iccid(std::string_view text) {
    return replaced(PseudonymKind::ICCID, text, startsAsTelecommunications(text) ? 2 : 0);
}

std::string DigitPseudonyms::imsi(std::string_view text) {
    const std::string digits = digitsOf(text);
    // Of something shorter nothing stays: it is no IMSI, and would be all code.
    constexpr std::size_t shortest = 10;
    return digits.size() < shortest ? replaced(PseudonymKind::Digits, text, 0)
                                    : replaced(PseudonymKind::IMSI, text, networkLengthOf(digits));
}

std::string DigitPseudonyms::networkOfIMSI(std::string_view text) const {
    std::string digits = digitsOf(text);
    if (_networks)
        maskNetwork(digits);
    return withDigits(text, digits);
}

std::string DigitPseudonyms::eid(std::string_view text) {
    return replaced(PseudonymKind::EID, text, startsAsTelecommunications(text) ? 2 : 0);
}

std::string DigitPseudonyms::phone(std::string_view text) {
    return replaced(PseudonymKind::Phone, text, 0);
}

std::string DigitPseudonyms::equipment(std::string_view text) {
    const bool isDecimal =
        std::ranges::none_of(text, [](char c) { return std::isalpha(static_cast<unsigned char>(c)) != 0; });
    return isDecimal ? replaced(PseudonymKind::Equipment, text, 0)
                     : hexadecimal(PseudonymKind::Equipment, text);
}

std::string DigitPseudonyms::hexadecimal(PseudonymKind kind, std::string_view text) {
    const auto valueOf = [](char c) {
        return hexadecimalDigits.find(c >= 'A' && c <= 'F' ? static_cast<char>(c - 'A' + 'a') : c);
    };
    std::vector<std::uint8_t> values;
    for (const char c : text)
        if (const std::size_t value = valueOf(c); value != std::string_view::npos)
            values.push_back(static_cast<std::uint8_t>(value));
    permute(_hash, kind, values, 16);
    const bool isUpper = std::ranges::any_of(text, [](char c) { return c >= 'A' && c <= 'F'; });
    std::string result(text);
    auto next = values.begin();
    for (char& c : result)
        if (valueOf(c) != std::string_view::npos) {
            c = hexadecimalDigits[*next++];
            if (isUpper && c >= 'a')
                c = static_cast<char>(c - 'a' + 'A');
        }
    return result;
}

} // namespace velmora
