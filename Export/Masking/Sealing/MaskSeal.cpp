// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/Sealing/MaskSeal.h"

#include "Export/Masking/MaskKey.h"

#include <algorithm>
#include <array>
#include <utility>

namespace velmora {

namespace {

constexpr std::string_view mark = "velmora-mask 1 level=";
constexpr std::string_view keyMark = " key=";
constexpr std::string_view digestMark = " messages=";
constexpr std::string_view positionsMark = " positions=";
constexpr std::size_t keyLength = 32;
constexpr std::size_t digestLength = 64;

// In a version report: mark, level, fingerprint, digest.
constexpr std::array<std::uint8_t, 7> reportMark = {'v', 'm', 'a', 's', 'k', 0, 1};

bool isHexadecimal(std::string_view text) {
    return text.find_first_not_of("0123456789abcdef") == std::string_view::npos;
}

/// Removes a mark and the digest after it from the beginning of a text; empty where they are not there.
std::string takeDigest(std::string_view& text, std::string_view digestsMark) {
    if (!text.starts_with(digestsMark))
        return {};
    std::string digest(text.substr(digestsMark.size(), digestLength));
    if (digest.size() != digestLength || !isHexadecimal(digest))
        return {};
    text.remove_prefix(digestsMark.size() + digestLength);
    return digest;
}

std::vector<std::uint8_t> bytesOf(std::string_view hexadecimal) {
    std::vector<std::uint8_t> bytes(hexadecimal.size() / 2);
    for (std::size_t i = 0; i < 2 * bytes.size(); ++i) {
        const char c = hexadecimal[i];
        bytes[i / 2] = static_cast<std::uint8_t>(bytes[i / 2] << 4 | (c <= '9' ? c - '0' : c - 'a' + 10));
    }
    return bytes;
}

} // namespace

std::string MaskSeal::text() const {
    std::string result(mark);
    result.append(nameOf(level)).append(keyMark).append(key);
    if (!digest.empty())
        result.append(digestMark).append(digest);
    if (!positions.empty())
        result.append(positionsMark).append(positions);
    return result;
}

std::optional<MaskSeal> MaskSeal::read(std::string_view text) {
    if (!text.starts_with(mark))
        return std::nullopt;
    text.remove_prefix(mark.size());
    const std::size_t end = text.find(keyMark);
    const auto level = maskLevelNamed(text.substr(0, end));
    if (end == std::string_view::npos || !level)
        return std::nullopt;
    MaskSeal seal{*level, std::string(text.substr(end + keyMark.size(), keyLength)), {}, {}};
    text.remove_prefix(std::min(end + keyMark.size() + keyLength, text.size()));
    if (seal.key.size() != keyLength || !isHexadecimal(seal.key))
        return std::nullopt;
    seal.digest = takeDigest(text, digestMark);
    if (!seal.digest.empty())
        seal.positions = takeDigest(text, positionsMark);
    return text.empty() ? std::optional(std::move(seal)) : std::nullopt;
}

std::vector<std::uint8_t> MaskSeal::bytes() const {
    std::vector<std::uint8_t> result(reportMark.begin(), reportMark.end());
    result.push_back(static_cast<std::uint8_t>(level));
    for (const std::string& part : {key, digest}) {
        const std::vector<std::uint8_t> bytes = bytesOf(part);
        result.insert(result.end(), bytes.begin(), bytes.end());
    }
    result.resize(reportLength);
    return result;
}

std::optional<MaskSeal> MaskSeal::read(Bytes bytes) {
    if (bytes.size() < reportLength || !std::equal(reportMark.begin(), reportMark.end(), bytes.begin()))
        return std::nullopt;
    bytes = bytes.subspan(reportMark.size());
    if (bytes[0] > static_cast<unsigned>(MaskLevel::All))
        return std::nullopt;
    return MaskSeal{static_cast<MaskLevel>(bytes[0]),
                    hexadecimalText(bytes.subspan(1, keyLength / 2)),
                    hexadecimalText(bytes.subspan(1 + keyLength / 2, digestLength / 2)),
                    {}};
}

void MessageDigest::add(std::string_view technology, Bytes message) {
    std::array<std::uint8_t, 16> lengths{};
    for (std::size_t i = 0; i < 8; ++i) {
        lengths[i] = static_cast<std::uint8_t>(technology.size() >> (8 * i));
        lengths[8 + i] = static_cast<std::uint8_t>(message.size() >> (8 * i));
    }
    _hash.add(lengths);
    _hash.add(Bytes(reinterpret_cast<const std::uint8_t*>(technology.data()), technology.size()));
    _hash.add(message);
}

void MessageDigest::addSentence(std::string_view text) {
    add("NMEA", Bytes(reinterpret_cast<const std::uint8_t*>(text.data()), text.size()));
}

std::string MessageDigest::text() {
    return hexadecimalText(_hash.digest());
}

} // namespace velmora
