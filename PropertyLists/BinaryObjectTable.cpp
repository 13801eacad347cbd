// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/BinaryObjectTable.h"

#include <algorithm>
#include <cstdio>
#include <string_view>

namespace velmora {

namespace {

constexpr std::string_view magic = "bplist00";
constexpr std::size_t trailerSize = 32;

} // namespace

Failure failureAt(std::size_t offset, const std::string& reason) {
    return Failure{"offset " + std::to_string(offset) + ": " + reason};
}

std::string hexByte(std::uint8_t byte) {
    char text[8];
    std::snprintf(text, sizeof text, "0x%02X", static_cast<unsigned>(byte));
    return text;
}

Result<BinaryObjectTable> BinaryObjectTable::open(Bytes input) {
    if (input.size() < magic.size() + trailerSize)
        return Failure{"the list has " + std::to_string(input.size()) + " bytes, fewer than the " +
                       std::to_string(magic.size() + trailerSize) + " of a header and a trailer"};
    if (!std::equal(magic.begin(), magic.end(), input.begin(), [](char wanted, std::uint8_t found) {
            return static_cast<std::uint8_t>(wanted) == found;
        }))
        return failureAt(0, "the list does not begin with \"bplist00\"");

    BinaryObjectTable result;
    result._input = input;
    const std::size_t trailer = input.size() - trailerSize;
    const std::uint64_t offsetSize = result.numberAt(trailer + 6, 1);
    const std::uint64_t referenceSize = result.numberAt(trailer + 7, 1);
    const std::uint64_t objectCount = result.numberAt(trailer + 8, 8);
    const std::uint64_t topObject = result.numberAt(trailer + 16, 8);
    const std::uint64_t table = result.numberAt(trailer + 24, 8);

    if (offsetSize < 1 || offsetSize > 8)
        return failureAt(trailer + 6, "offsets have " + std::to_string(offsetSize) + " bytes, not 1 to 8");
    if (referenceSize < 1 || referenceSize > 8)
        return failureAt(trailer + 7,
                         "references have " + std::to_string(referenceSize) + " bytes, not 1 to 8");
    if (topObject >= objectCount)
        return failureAt(trailer + 16, "the root is object " + std::to_string(topObject) + " of " +
                                           std::to_string(objectCount));
    if (table < magic.size() || table > trailer)
        return failureAt(trailer + 24, "the offset table begins at " + std::to_string(table) + ", not from " +
                                           std::to_string(magic.size()) + " to " + std::to_string(trailer));
    if (objectCount > (trailer - table) / offsetSize)
        return failureAt(trailer + 8, std::to_string(objectCount) + " offsets of " +
                                          std::to_string(offsetSize) + " bytes do not fit the table's " +
                                          std::to_string(trailer - table));
    result._offsetSize = static_cast<std::size_t>(offsetSize);
    result._referenceSize = static_cast<std::size_t>(referenceSize);
    result._objectCount = objectCount;
    result._topObject = topObject;
    result._table = static_cast<std::size_t>(table);
    return result;
}

Result<BinaryObject> BinaryObjectTable::object(std::uint64_t index) const {
    // The index is below the object count, whose offsets all lie inside the input: nothing overflows here.
    const std::size_t entry = _table + static_cast<std::size_t>(index) * _offsetSize;
    const std::uint64_t offset = numberAt(entry, _offsetSize);
    if (offset < magic.size() || offset >= _table)
        return failureAt(entry, "object " + std::to_string(index) + " lies at " + std::to_string(offset) +
                                    ", not from " + std::to_string(magic.size()) + " to " +
                                    std::to_string(_table - 1));
    const auto start = static_cast<std::size_t>(offset);
    return BinaryObject{start, _input[start], start + 1, 0};
}

/// The count is in the marker's low half or, where that is 15, in an integer object after the marker.
Result<Done> BinaryObjectTable::readCount(BinaryObject& object) const {
    object.count = object.marker & 0x0F;
    if (object.count != 0x0F)
        return Done{};
    if (object.content >= _table)
        return failureAt(object.content, "the count is missing");
    const std::uint8_t marker = _input[object.content];
    if (marker < 0x10 || marker > 0x13)
        return failureAt(object.content, "the count has marker " + hexByte(marker) + ", not 0x10 to 0x13");
    const std::size_t size = std::size_t{1} << (marker & 0x0F);
    if (size > _table - object.content - 1)
        return failureAt(object.content, "the count is cut off");
    object.count = numberAt(object.content + 1, size);
    object.content += 1 + size;
    return Done{};
}

} // namespace velmora
