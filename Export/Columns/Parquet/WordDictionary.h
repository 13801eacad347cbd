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
        // There are millions of values, nearly all of which are where they belong.
        if (!_slots.empty())
            if (const Slot& slot = _slots[homeOf(value)]; slot.value == value && slot.number != 0)
                return static_cast<std::uint16_t>(slot.number - 1);
        return find(value);
    }
    [[nodiscard]] const std::vector<std::uint64_t>& values() const { return _values; }
    /// Bytes of memory.
    [[nodiscard]] std::size_t size() const {
        return _values.capacity() * sizeof(std::uint64_t) + _slots.capacity() * sizeof(Slot);
    }

private:
    struct Slot {
        std::uint64_t value = 0;
        std::uint32_t number = 0; ///< an index and 1; 0 where the slot is free
    };

    [[nodiscard]] std::size_t homeOf(std::uint64_t value) const {
        constexpr std::uint64_t spread = 0x9E3779B97F4A7C15; // 2^64 divided by the golden ratio
        return static_cast<std::size_t>((value ^ value >> 29) * spread >> 32) & (_slots.size() - 1);
    }
    [[nodiscard]] std::optional<std::uint16_t> find(std::uint64_t value);
    [[nodiscard]] Slot& slotOf(std::uint64_t value);
    void grow();

    std::vector<std::uint64_t> _values;
    std::vector<Slot> _slots; ///< a power of two
};

} // namespace velmora
