// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/ValueEncodings.h"

#include <algorithm>
#include <string>

namespace velmora {

namespace {

using Buffer = std::vector<std::uint8_t>;

Buffer bytesOf(std::string_view text) {
    return {text.begin(), text.end()};
}

Buffer utf16(std::string_view text, bool isBigEndian) {
    Buffer result;
    for (const char c : text) {
        const auto byte = static_cast<std::uint8_t>(c);
        result.push_back(isBigEndian ? std::uint8_t{0} : byte);
        result.push_back(isBigEndian ? byte : std::uint8_t{0});
    }
    return result;
}

/// The pairs of digits from the offset on, which are bytes of their own.
Buffer packed(std::string_view digits, std::size_t offset, bool isSwapped) {
    Buffer result;
    for (std::size_t i = offset; i + 1 < digits.size(); i += 2) {
        const int first = digits[i] - '0';
        const int second = digits[i + 1] - '0';
        result.push_back(static_cast<std::uint8_t>(isSwapped ? second << 4 | first : first << 4 | second));
    }
    return result;
}

Buffer hexadecimal(const Buffer& bytes, std::string_view digits) {
    Buffer result;
    for (const std::uint8_t byte : bytes) {
        result.push_back(static_cast<std::uint8_t>(digits[byte >> 4]));
        result.push_back(static_cast<std::uint8_t>(digits[byte & 0xF]));
    }
    return result;
}

/// The characters that depend on the bytes alone, where `before` bytes (0 to 2) precede them in their group.
Buffer base64(const Buffer& bytes, std::size_t before) {
    constexpr std::string_view digits = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
    constexpr std::size_t bitsOfDigit = 6;
    Buffer padded(before);
    padded.insert(padded.end(), bytes.begin(), bytes.end());
    padded.push_back(0);
    Buffer result;
    const std::size_t first = (8 * before + bitsOfDigit - 1) / bitsOfDigit;
    const std::size_t end = 8 * (before + bytes.size()) / bitsOfDigit;
    for (std::size_t i = first; i < end; ++i) {
        const std::size_t bit = i * bitsOfDigit;
        const unsigned pair = static_cast<unsigned>(padded[bit / 8] << 8 | padded[bit / 8 + 1]);
        result.push_back(static_cast<std::uint8_t>(digits[pair >> (16 - bitsOfDigit - bit % 8) & 0x3F]));
    }
    return result;
}

void add(std::vector<EncodedValue>& all, ValueEncoding encoding, Buffer bytes) {
    const bool isNew =
        std::ranges::none_of(all, [&](const EncodedValue& each) { return each.bytes == bytes; });
    if (bytes.size() >= shortestEncoding && isNew)
        all.push_back({encoding, std::move(bytes)});
}

} // namespace

std::string_view nameOf(ValueEncoding encoding) {
    constexpr std::string_view names[] = {
        "text",        "UTF-16 little-endian",       "UTF-16 big-endian", "BCD",
        "swapped BCD", "swapped BCD in hexadecimal", "hexadecimal",       "base64"};
    return names[static_cast<unsigned>(encoding)];
}

std::vector<EncodedValue> encodingsOf(std::string_view value) {
    std::string digits;
    for (const char c : value)
        if (c != ' ' && c != '-' && c != '+')
            digits += c;
    const bool isNumber = !digits.empty() && digits.find_first_not_of("0123456789") == std::string::npos;
    std::vector<EncodedValue> plain;
    for (const std::string_view text : {value, isNumber ? std::string_view(digits) : std::string_view()}) {
        add(plain, ValueEncoding::Text, bytesOf(text));
        add(plain, ValueEncoding::UTF16Little, utf16(text, false));
        add(plain, ValueEncoding::UTF16Big, utf16(text, true));
    }
    if (isNumber)
        for (const std::size_t offset : {std::size_t{0}, std::size_t{1}})
            for (const bool isSwapped : {false, true})
                add(plain, isSwapped ? ValueEncoding::SwappedBCD : ValueEncoding::BCD,
                    packed(digits, offset, isSwapped));
    std::vector<EncodedValue> all = plain;
    for (const auto& [encoding, bytes] : plain) {
        const bool isText = encoding == ValueEncoding::Text;
        if (isText || encoding == ValueEncoding::SwappedBCD)
            for (const char* const each : {"0123456789abcdef", "0123456789ABCDEF"})
                add(all, isText ? ValueEncoding::Hexadecimal : ValueEncoding::SwappedText,
                    hexadecimal(bytes, each));
        for (const std::size_t before : {std::size_t{0}, std::size_t{1}, std::size_t{2}})
            add(all, ValueEncoding::Base64, base64(bytes, before));
    }
    return all;
}

} // namespace velmora
