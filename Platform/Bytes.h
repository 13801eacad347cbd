#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <span>
#include <utility>
#include <vector>

namespace velmora {

/// A view of bytes that somebody else owns.
using Bytes = std::span<const std::uint8_t>;

/// A shared, unchanging byte buffer, or a window on one. Copying it, or taking a part of it, copies no byte:
/// the log message that arrived at the port, the record without its prefix, the state's raw log and the
/// snapshot's entry can all be the same memory. May be passed between threads like a shared_ptr.
class Data {
public:
    Data() = default;

    /// Takes the buffer over.
    explicit Data(std::vector<std::uint8_t>&& buffer) {
        auto owner = std::make_shared<const std::vector<std::uint8_t>>(std::move(buffer));
        _window = Bytes(*owner);
        _owner = std::move(owner);
    }

    /// A buffer of its own with the same bytes.
    [[nodiscard]] static Data copyOf(Bytes bytes) {
        return Data(std::vector<std::uint8_t>(bytes.begin(), bytes.end()));
    }

    /// `length` bytes of a buffer that its owner shares out, from `offset` on, cut to what the buffer holds.
    /// The bytes in the window must not change any more; the window keeps the whole buffer alive.
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
