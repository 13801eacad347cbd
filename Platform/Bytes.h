// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <bit>
#include <concepts>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <memory>
#include <span>
#include <utility>
#include <vector>

namespace velmora {

/// A view of bytes; it does not own them.
using Bytes = std::span<const std::uint8_t>;

/// The number that begins at `bytes`, which must hold all of it. A single load, which compilers do not make
/// of a loop over bytes everywhere.
template <std::unsigned_integral Number>
[[nodiscard]] inline Number numberAt(const std::uint8_t* bytes, std::endian order) {
    Number number = 0;
    std::memcpy(&number, bytes, sizeof number);
    if (order == std::endian::native)
        return number;
    if constexpr (sizeof number == 8)
        return __builtin_bswap64(number);
    else if constexpr (sizeof number == 4)
        return __builtin_bswap32(number);
    else if constexpr (sizeof number == 2)
        return __builtin_bswap16(number);
    else
        return number;
}

/// A shared, immutable byte buffer, or a window on one. Copying it, or taking a part of it, copies no byte:
/// the log message that arrived at the port, the record without its prefix, the state's raw log and the
/// snapshot's entry can all be the same memory. May be passed between threads like a shared_ptr.
class Data {
public:
    Data() = default;

    /// Takes ownership of the buffer.
    explicit Data(std::vector<std::uint8_t>&& buffer) {
        auto owner = std::make_shared<const std::vector<std::uint8_t>>(std::move(buffer));
        _window = Bytes(*owner);
        _owner = std::move(owner);
    }

    /// An independent buffer with the same bytes.
    [[nodiscard]] static Data copyOf(Bytes bytes) {
        return Data(std::vector<std::uint8_t>(bytes.begin(), bytes.end()));
    }

    /// `length` bytes of a shared buffer from `offset` on, truncated to the buffer's size. The bytes in the
    /// window must not change any more; the window keeps the entire buffer alive.
    Data(std::shared_ptr<const std::vector<std::uint8_t>> owner, std::size_t offset, std::size_t length)
        : _owner(std::move(owner)) {
        if (_owner && offset < _owner->size())
            _window = Bytes(*_owner).subspan(offset, std::min(length, _owner->size() - offset));
    }

    [[nodiscard]] Bytes bytes() const { return _window; }
    [[nodiscard]] std::size_t size() const { return _window.size(); }
    [[nodiscard]] bool empty() const { return _window.empty(); }

    /// The bytes from `offset` on; empty when there are none.
    [[nodiscard]] Data from(std::size_t offset) const {
        Data rest = *this;
        rest._window = offset < size() ? _window.subspan(offset) : Bytes();
        return rest;
    }

    friend bool operator==(const Data& a, const Data& b) {
        return std::equal(a._window.begin(), a._window.end(), b._window.begin(), b._window.end());
    }

private:
    std::shared_ptr<const std::vector<std::uint8_t>> _owner;
    Bytes _window;
};

} // namespace velmora
