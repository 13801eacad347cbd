// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/BinaryScalars.h"

#include "PropertyLists/PropertyListDate.h"

#include <bit>
#include <chrono>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <string>

namespace velmora {

namespace {

std::size_t bytesLeft(const BinaryObjectTable& table, const BinaryObject& object) {
    return table.end() - object.content;
}

Failure tooShort(const BinaryObjectTable& table, const BinaryObject& object, std::size_t size) {
    return failureAt(object.offset, "the object with marker " + hexByte(object.marker) + " needs " +
                                        std::to_string(size) + " bytes, " +
                                        std::to_string(bytesLeft(table, object)) + " are left");
}

} // namespace

// Numbers of 1, 2 and 4 bytes have no sign, those of 8 and 16 have.
Result<Value> binaryInteger(const BinaryObjectTable& table, const BinaryObject& object) {
    const int power = object.marker & 0x0F;
    if (power > 4)
        return failureAt(object.offset,
                         "an integer has marker " + hexByte(object.marker) + ", not 0x10 to 0x14");
    const std::size_t size = std::size_t{1} << power;
    if (size > bytesLeft(table, object))
        return tooShort(table, object, size);
    if (size == 16) {
        const std::uint64_t high = table.numberAt(object.content, 8);
        const auto low = static_cast<std::int64_t>(table.numberAt(object.content + 8, 8));
        if (high != (low < 0 ? std::numeric_limits<std::uint64_t>::max() : 0))
            return failureAt(object.offset, "an integer of 16 bytes does not fit 64 bits");
        return Value(low);
    }
    return Value(static_cast<std::int64_t>(table.numberAt(object.content, size)));
}

Result<Value> binaryReal(const BinaryObjectTable& table, const BinaryObject& object) {
    if (object.marker != 0x22 && object.marker != 0x23)
        return failureAt(object.offset, "a real has marker " + hexByte(object.marker) + ", not 0x22 or 0x23");
    const std::size_t size = object.marker == 0x22 ? 4 : 8;
    if (size > bytesLeft(table, object))
        return tooShort(table, object, size);
    const std::uint64_t bits = table.numberAt(object.content, size);
    return Value(size == 4 ? static_cast<double>(std::bit_cast<float>(static_cast<std::uint32_t>(bits)))
                           : std::bit_cast<double>(bits));
}

Result<Value> binaryDate(const BinaryObjectTable& table, const BinaryObject& object) {
    if (object.marker != 0x33)
        return failureAt(object.offset, "a date has marker " + hexByte(object.marker) + ", not 0x33");
    if (bytesLeft(table, object) < 8)
        return tooShort(table, object, 8);
    const double seconds = std::floor(std::bit_cast<double>(table.numberAt(object.content, 8)));
    const auto secondsTo = [](Date date) { return static_cast<double>((date - binaryDateEpoch).count()); };
    // Written so that a NaN fails as well.
    if (!(seconds >= secondsTo(earliestDate) && seconds <= secondsTo(latestDate)))
        return failureAt(object.offset, "a date lies outside the years 0001 to 9999");
    return Value(binaryDateEpoch + std::chrono::seconds(static_cast<std::int64_t>(seconds)));
}

} // namespace velmora
