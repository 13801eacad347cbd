// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Result.h"

#include <cstddef>
#include <cstdint>
#include <string>

namespace velmora {

/// One object of a binary property list: its marker, and where what follows the marker begins.
struct BinaryObject {
    std::size_t offset = 0; ///< of the marker
    std::uint8_t marker = 0;
    std::size_t content = 0;
    std::uint64_t count = 0; ///< bytes, units or entries, once `readCount` has read it
};

/// The frame of a binary property list: the header, the trailer with its sizes, and the offset table by which
/// objects are found. The offsets that it returns lie inside the input; whether an object's content does has
/// to be checked against `end`. Views the input, which must outlive it.
class BinaryObjectTable {
public:
    /// Checks header and trailer. The reason names the field that is wrong.
    [[nodiscard]] static Result<BinaryObjectTable> open(Bytes input);

    [[nodiscard]] std::uint64_t objectCount() const { return _objectCount; }
    [[nodiscard]] std::uint64_t topObject() const { return _topObject; }
    /// Bytes of a reference, 1 to 8.
    [[nodiscard]] std::size_t referenceSize() const { return _referenceSize; }
    /// Where the objects end and the offset table begins.
    [[nodiscard]] std::size_t end() const { return _table; }

    /// A big-endian number of 1 to 8 bytes. Precondition: the bytes lie inside the input.
    [[nodiscard]] std::uint64_t numberAt(std::size_t offset, std::size_t size) const {
        std::uint64_t number = 0;
        for (const std::uint8_t byte : _input.subspan(offset, size))
            number = number << 8 | byte;
        return number;
    }
    /// Precondition: the bytes lie inside the input.
    [[nodiscard]] Bytes bytesAt(std::size_t offset, std::size_t size) const {
        return _input.subspan(offset, size);
    }

    /// The object of that index. Precondition: index < objectCount().
    [[nodiscard]] Result<BinaryObject> object(std::uint64_t index) const;
    /// Sets the object's count, of any size, and moves its content past the count.
    [[nodiscard]] Result<Done> readCount(BinaryObject& object) const;

private:
    Bytes _input;
    std::size_t _offsetSize = 0;
    std::size_t _referenceSize = 0;
    std::uint64_t _objectCount = 0;
    std::uint64_t _topObject = 0;
    std::size_t _table = 0;
};

/// "offset 8: " and the reason.
[[nodiscard]] Failure failureAt(std::size_t offset, const std::string& reason);
/// "0x0F".
[[nodiscard]] std::string hexByte(std::uint8_t byte);

} // namespace velmora
