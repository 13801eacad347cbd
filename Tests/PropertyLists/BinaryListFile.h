// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/PropertyList.h"
#include "Tests/PropertyLists/PropertyListSamples.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

using Buffer = std::vector<std::uint8_t>;

inline void appendBigEndian(Buffer& bytes, std::uint64_t number, std::size_t size) {
    for (std::size_t i = size; i-- > 0;)
        bytes.push_back(static_cast<std::uint8_t>(number >> (8 * i)));
}

/// What a trailer says; absent fields are worked out from the objects.
struct Trailer {
    std::uint64_t offsetSize = 4;
    std::uint64_t referenceSize = 4;
    std::optional<std::uint64_t> objectCount = std::nullopt;
    std::uint64_t topObject = 0;
    std::optional<std::uint64_t> table = std::nullopt;
};

/// A list of the objects, each given with its marker, with offsets and references of four bytes.
inline Buffer listOf(const std::vector<Data>& objects, const Trailer& trailer = {}) {
    Buffer bytes = bytesOf("bplist00");
    std::vector<std::size_t> offsets;
    for (const Data& object : objects) {
        offsets.push_back(bytes.size());
        bytes.insert(bytes.end(), object.bytes().begin(), object.bytes().end());
    }
    const std::size_t table = bytes.size();
    for (const std::size_t offset : offsets)
        appendBigEndian(bytes, offset, 4);
    appendBigEndian(bytes, 0, 6);
    appendBigEndian(bytes, trailer.offsetSize, 1);
    appendBigEndian(bytes, trailer.referenceSize, 1);
    appendBigEndian(bytes, trailer.objectCount.value_or(objects.size()), 8);
    appendBigEndian(bytes, trailer.topObject, 8);
    appendBigEndian(bytes, trailer.table.value_or(table), 8);
    return bytes;
}

/// Why the list is refused; "read" where it is not.
inline std::string reasonOf(const Buffer& bytes, const PropertyListLimits& limits = {}) {
    const auto value = readPropertyList(bytes, limits);
    return value ? "read" : value.reason();
}

} // namespace velmora
