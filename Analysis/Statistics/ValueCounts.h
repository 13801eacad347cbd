// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/ExactSum.h"

#include <bit>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <vector>

namespace velmora {

/// How often each value occurred, in bounded memory. Reported quantities lie on a grid, so that few values
/// differ, and all figures are exact. Where more than `most` values differ, each is rounded to as many
/// leading binary digits as keep them apart in that number of places: count, minimum, maximum and mean stay
/// exact, and a percentile is within `relativeError` of the exact one. What it holds depends on the values
/// alone, not on their order or on how they were divided before they were merged.
class ValueCounts {
public:
    /// Above any number of values that a quantity on a grid has.
    static constexpr std::size_t usualMost = 4096;

    /// `most`: at least 2.
    explicit ValueCounts(std::size_t most = usualMost) : _most(most) {}

    /// Precondition: the value is finite.
    void add(double value) {
        ++_count;
        _minimum = _count == 1 || value < _minimum ? value : _minimum;
        _maximum = _count == 1 || value > _maximum ? value : _maximum;
        const std::uint64_t key = keyOf(value);
        // There are millions of values, nearly all of which are where they belong.
        if (_coarseness == 0 && !_slots.empty())
            if (Slot& slot = _slots[homeOf(key)]; slot.key == key && slot.count != 0) {
                ++slot.count;
                return;
            }
        addKey(value, key);
    }
    void add(const ValueCounts& other);

    [[nodiscard]] std::uint64_t count() const { return _count; }
    /// Preconditions of these: there is a value.
    [[nodiscard]] double minimum() const { return _minimum; }
    [[nodiscard]] double maximum() const { return _maximum; }
    /// The exact sum, rounded, divided by the count; absent where it is no finite number.
    [[nodiscard]] std::optional<double> mean() const;

    struct Entry {
        double value;
        std::uint64_t count;
    };
    /// The smallest value first.
    [[nodiscard]] std::vector<Entry> sorted() const;
    /// How far an entry's value may be from those that it stands for, as a part of these; 0 where it is
    /// exact, infinite where not even the order of magnitude is kept.
    [[nodiscard]] double relativeError() const;

private:
    struct Slot {
        std::uint64_t key = 0;
        std::uint64_t count = 0; ///< 0 for a free one
    };

    [[nodiscard]] static std::uint64_t keyOf(double value) {
        return std::bit_cast<std::uint64_t>(value + 0.0); // -0 is 0
    }
    [[nodiscard]] double valueOf(std::uint64_t key) const;
    [[nodiscard]] std::uint64_t coarse(std::uint64_t key) const { return key >> _coarseness << _coarseness; }
    [[nodiscard]] std::size_t homeOf(std::uint64_t key) const {
        constexpr std::uint64_t spread = 0x9E3779B97F4A7C15; // 2^64 divided by the golden ratio
        // The leading bits of the product: the keys of quarters differ in their leading bits alone.
        return static_cast<std::size_t>(key * spread >> _shift);
    }
    [[nodiscard]] std::size_t slotOf(std::uint64_t key) const;
    void addKey(double value, std::uint64_t key);
    void insert(std::uint64_t key, std::uint64_t count);
    void rehash(std::size_t capacity);
    void coarsen();

    std::size_t _most;
    std::uint64_t _count = 0;
    double _minimum = 0;
    double _maximum = 0;
    unsigned _coarseness = 0;   ///< how many trailing binary digits are dropped
    std::vector<Slot> _slots;   ///< a hash table; its size is 0 or a power of two
    std::size_t _used = 0;      ///< slots
    int _shift = 0;             ///< what is left of 64 bits is a slot
    std::vector<ExactSum> _sum; ///< of the exact values, once slots are rounded; else empty
};

/// The smallest value that at least `percent` % of the values do not exceed (nearest rank), from 0 to 100:
/// always one that occurred. Precondition: there is one.
[[nodiscard]] double percentileOf(const std::vector<ValueCounts::Entry>& sorted, std::uint64_t count,
                                  unsigned percent);

} // namespace velmora
