// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/MaskKey.h"

#include "Export/Masking/Pseudonyms/KeyedHash.h"

#include <cerrno>
#include <system_error>

#include <sys/random.h>

namespace velmora {

namespace {

constexpr std::string_view hexadecimalDigits = "0123456789abcdef";
constexpr std::size_t fingerprintLength = 16;

int valueOf(char digit) {
    if (digit >= 'A' && digit <= 'F')
        digit = static_cast<char>(digit - 'A' + 'a');
    const std::size_t value = hexadecimalDigits.find(digit);
    return value == std::string_view::npos ? -1 : static_cast<int>(value);
}

} // namespace

std::string hexadecimalText(Bytes bytes) {
    std::string text;
    for (const std::uint8_t byte : bytes)
        text.append({hexadecimalDigits[byte >> 4], hexadecimalDigits[byte & 0xF]});
    return text;
}

Result<MaskKey> MaskKey::random() {
    MaskKey key;
    if (::getentropy(key.bytes.data(), key.bytes.size()) != 0)
        return Failure{"cannot make a key: " + std::generic_category().message(errno)};
    return key;
}

Result<MaskKey> MaskKey::read(std::string_view text) {
    while (!text.empty() && std::string_view(" \t\r\n").find(text.back()) != std::string_view::npos)
        text.remove_suffix(1);
    if (text.size() != 2 * length)
        return Failure{"no key: " + std::to_string(text.size()) +
                       " characters, wanted 64 hexadecimal digits"};
    MaskKey key;
    for (std::size_t i = 0; i < text.size(); ++i) {
        const int value = valueOf(text[i]);
        if (value < 0)
            return Failure{"no key: character " + std::to_string(i + 1) +
                           " is none, wanted 64 hexadecimal digits"};
        key.bytes[i / 2] = static_cast<std::uint8_t>(key.bytes[i / 2] << 4 | value);
    }
    return key;
}

std::string MaskKey::text() const {
    return hexadecimalText(bytes);
}

std::string MaskKey::fingerprint() const {
    constexpr std::string_view purpose = "velmora mask fingerprint";
    const KeyedHash::Digest digest =
        KeyedHash(bytes)(Bytes(reinterpret_cast<const std::uint8_t*>(purpose.data()), purpose.size()));
    return hexadecimalText(Bytes(digest).first(fingerprintLength));
}

} // namespace velmora
