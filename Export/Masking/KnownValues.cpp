// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/KnownValues.h"

#include "PropertyLists/Value.h"

#include <algorithm>
#include <array>
#include <string_view>

#include <zlib.h>

namespace velmora {

namespace {

/// Compressed data in compressed data, and so on.
constexpr unsigned deepest = 3;
/// What is unpacked of one compressed part: a few bytes may unpack to any size.
constexpr std::size_t mostUnpacked = std::size_t{64} << 20;

std::uint32_t startOf(const std::uint8_t* bytes) {
    return numberAt<std::uint32_t>(bytes, std::endian::little);
}

/// Whether gzip (RFC 1952) or zlib (RFC 1950) data may begin with these bytes.
bool mayBeCompressed(std::uint8_t first, std::uint8_t second) {
    constexpr unsigned deflateWithWindow = 0x78;
    return (first == 0x1F && second == 0x8B) ||
           (first == deflateWithWindow && (first << 8 | second) % 31 == 0);
}

} // namespace

KnownValues::KnownValues(const std::vector<std::string>& values) {
    for (std::size_t i = 0; i < values.size(); ++i)
        for (EncodedValue& encoded : encodingsOf(values[i])) {
            _longest = std::max(_longest, encoded.bytes.size());
            const std::uint32_t start = startOf(encoded.bytes.data());
            _starts.set(start & 0xFFFF);
            _byStart[start].push_back(_patterns.size());
            _patterns.push_back({i, std::move(encoded)});
        }
}

void KnownValues::search(Bytes bytes) {
    searchPlain(bytes);
    searchCompressed(bytes, 0);
}

void KnownValues::search(const Value& list) {
    if (const std::string* const text = list.asString()) {
        searchPlain(Bytes(reinterpret_cast<const std::uint8_t*>(text->data()), text->size()));
    } else if (const Data* const data = list.asData()) {
        search(data->bytes());
    } else if (const Array* const array = list.asArray()) {
        for (const Value& each : *array)
            search(each);
    } else if (const Dictionary* const dictionary = list.asDictionary()) {
        for (const auto& [key, value] : *dictionary) {
            search(Value(key));
            search(value);
        }
    } else if (const std::int64_t* const integer = list.asInteger()) {
        search(Value(std::to_string(*integer)));
    }
}

void KnownValues::searchPlain(Bytes bytes) {
    for (std::size_t at = 0; at + shortestEncoding <= bytes.size(); ++at) {
        if (!_starts.test(numberAt<std::uint16_t>(&bytes[at], std::endian::little)))
            continue;
        const auto found = _byStart.find(startOf(&bytes[at]));
        if (found == _byStart.end())
            continue;
        for (const std::size_t index : found->second) {
            const auto& [value, encoded] = _patterns[index];
            const Bytes rest = bytes.subspan(at);
            if (rest.size() >= encoded.bytes.size() &&
                std::equal(encoded.bytes.begin(), encoded.bytes.end(), rest.begin()))
                _findings.emplace(value, encoded.encoding);
        }
    }
}

void KnownValues::searchCompressed(Bytes bytes, unsigned depth) {
    if (depth == deepest)
        return;
    for (std::size_t at = 0; at + shortestEncoding <= bytes.size(); ++at)
        if (mayBeCompressed(bytes[at], bytes[at + 1]))
            inflateFrom(bytes.subspan(at), depth);
}

void KnownValues::inflateFrom(Bytes bytes, unsigned depth) {
    z_stream stream{};
    constexpr int eitherForm = 15 + 32;
    if (inflateInit2(&stream, eitherForm) != Z_OK)
        return;
    std::vector<std::uint8_t> input(bytes.begin(), bytes.end());
    stream.next_in = input.data();
    stream.avail_in = static_cast<uInt>(input.size());
    std::vector<std::uint8_t> window(overlap() + (std::size_t{64} << 10));
    std::size_t kept = 0;
    std::size_t unpacked = 0;
    for (int result = Z_OK; result == Z_OK && unpacked < mostUnpacked;) {
        stream.next_out = window.data() + kept;
        stream.avail_out = static_cast<uInt>(window.size() - kept);
        result = inflate(&stream, Z_NO_FLUSH);
        const std::size_t end = window.size() - stream.avail_out;
        unpacked += end - kept;
        if (end == kept)
            break;
        const Bytes filled = Bytes(window).first(end);
        searchPlain(filled);
        searchCompressed(filled, depth + 1);
        kept = std::min(overlap(), end);
        std::copy_backward(filled.end() - static_cast<std::ptrdiff_t>(kept), filled.end(),
                           window.begin() + static_cast<std::ptrdiff_t>(kept));
    }
    inflateEnd(&stream);
}

} // namespace velmora
