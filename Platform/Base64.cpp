// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Base64.h"

#include <algorithm>
#include <array>

namespace velmora {

namespace {

constexpr std::string_view digits = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
constexpr std::uint8_t noDigit = 0xFF;

constexpr std::array<std::uint8_t, 256> digitValues = []() {
    std::array<std::uint8_t, 256> values{};
    for (auto& value : values)
        value = noDigit;
    for (std::size_t i = 0; i < digits.size(); ++i)
        values[static_cast<unsigned char>(digits[i])] = static_cast<std::uint8_t>(i);
    return values;
}();

bool isSpace(char character) {
    return character == ' ' || character == '\t' || character == '\n' || character == '\r';
}

} // namespace

void putBase64(char* text, Bytes bytes) {
    while (!bytes.empty()) {
        const std::size_t present = std::min<std::size_t>(bytes.size(), 3);
        std::uint32_t group = 0;
        for (std::size_t i = 0; i < 3; ++i)
            group = group << 8 | (i < present ? bytes[i] : 0U);
        for (std::size_t i = 0; i < 4; ++i)
            *text++ = i <= present ? digits[group >> (18 - 6 * i) & 0x3F] : '=';
        bytes = bytes.subspan(present);
    }
}

std::optional<std::vector<std::uint8_t>> bytesOfBase64(std::string_view text) {
    std::vector<std::uint8_t> bytes;
    bytes.reserve(text.size() / 4 * 3);
    std::uint32_t group = 0;
    std::size_t count = 0;
    std::size_t padding = 0;
    for (const char character : text) {
        if (isSpace(character))
            continue;
        if (character == '=') {
            ++padding;
            continue;
        }
        const std::uint8_t value = digitValues[static_cast<unsigned char>(character)];
        if (value == noDigit || padding > 0)
            return std::nullopt;
        group = group << 6 | value;
        if (++count % 4 == 0) {
            bytes.push_back(static_cast<std::uint8_t>(group >> 16 & 0xFF));
            bytes.push_back(static_cast<std::uint8_t>(group >> 8 & 0xFF));
            bytes.push_back(static_cast<std::uint8_t>(group & 0xFF));
        }
    }
    const std::size_t rest = count % 4;
    if (rest == 1 || padding != (rest == 0 ? 0 : 4 - rest))
        return std::nullopt;
    if (rest >= 2)
        bytes.push_back(static_cast<std::uint8_t>(group >> (rest == 2 ? 4 : 10) & 0xFF));
    if (rest == 3)
        bytes.push_back(static_cast<std::uint8_t>(group >> 2 & 0xFF));
    return bytes;
}

} // namespace velmora
