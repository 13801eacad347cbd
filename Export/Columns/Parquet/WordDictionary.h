// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <vector>

namespace velmora {

/// The different values of a column of 64 bits, in the order in which they were first seen.
class WordDictionary {
public:
    /// How many it has room for; an index has 14 bits.
    static constexpr std::size_t mostValues = std::size_t{1} << 14;

    /// The index of the value, which is added where there is room; absent where there is none.
    [[nodiscard]] std::optional<std::uint16_t> indexOf(std::uint64_t value) {
        if (value == _last && !_values.empty())
            return _lastIndex;
        return find(value);
    }
    [[nodiscard]] const std::vector<std::uint64_t>& values() const { return _values; }
    /// Bytes of memory.
    [[nodiscard]] std::size_t size() const { return _values.capacity() * 8 + _slots.capacity() * 2; }

private:
    [[nodiscard]] std::optional<std::uint16_t> find(std::uint64_t value);
    [[nodiscard]] std::size_t slotOf(std::uint64_t value) const;
    void grow();

    std::vector<std::uint64_t> _values;
    std::vector<std::uint16_t> _slots; ///< an index and 1 each; 0 where it is free
    std::uint64_t _last = 0;
    std::uint16_t _lastIndex = 0;
};

} // namespace velmora
