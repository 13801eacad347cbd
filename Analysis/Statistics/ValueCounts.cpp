// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/ValueCounts.h"

#include <algorithm>
#include <bit>
#include <cmath>
#include <limits>

namespace velmora {

namespace {

constexpr unsigned fractionBits = 52;
constexpr unsigned bitsBesideSign = 63;
constexpr std::size_t smallestTable = 8;

} // namespace

/// The middle of those that the key stands for.
double ValueCounts::valueOf(std::uint64_t key) const {
    const bool isZero = key << 1 == 0;
    if (_coarseness == 0 || (isZero && _coarseness <= fractionBits))
        return std::bit_cast<double>(key);
    const auto middle = std::bit_cast<double>(key | std::uint64_t{1} << (_coarseness - 1));
    return std::isfinite(middle) ? std::clamp(middle, _minimum, _maximum)
                                 : (middle < 0 ? _minimum : _maximum);
}

std::size_t ValueCounts::slotOf(std::uint64_t key) const {
    const std::size_t mask = _slots.size() - 1;
    std::size_t slot = homeOf(key);
    while (_slots[slot].count != 0 && _slots[slot].key != key)
        slot = (slot + 1) & mask;
    return slot;
}

void ValueCounts::addKey(double value, std::uint64_t key) {
    if (!_sum.empty())
        _sum.front().add(value);
    insert(coarse(key), 1);
}

void ValueCounts::insert(std::uint64_t key, std::uint64_t count) {
    if (2 * (_used + 1) > _slots.size())
        rehash(std::max(smallestTable, 2 * _slots.size()));
    Slot& slot = _slots[slotOf(key)];
    if (slot.count == 0) {
        slot.key = key;
        ++_used;
    }
    slot.count += count;
    while (_used > _most)
        coarsen();
}

void ValueCounts::rehash(std::size_t capacity) {
    std::vector<Slot> earlier(capacity);
    earlier.swap(_slots);
    _shift = std::countl_zero(capacity) + 1;
    _used = 0;
    for (const Slot& each : earlier)
        if (each.count != 0) {
            Slot& slot = _slots[slotOf(coarse(each.key))];
            _used += slot.count == 0 ? 1 : 0;
            slot.key = coarse(each.key);
            slot.count += each.count;
        }
}

void ValueCounts::coarsen() {
    if (_sum.empty()) {
        _sum.emplace_back();
        for (const Slot& each : _slots)
            if (each.count != 0)
                _sum.front().add(std::bit_cast<double>(each.key), each.count);
    }
    _coarseness = std::min(_coarseness + 1, bitsBesideSign);
    rehash(_slots.size());
}

void ValueCounts::add(const ValueCounts& other) {
    if (other._count == 0)
        return;
    while (_coarseness < other._coarseness)
        coarsen();
    _minimum = _count == 0 ? other._minimum : std::min(_minimum, other._minimum);
    _maximum = _count == 0 ? other._maximum : std::max(_maximum, other._maximum);
    _count += other._count;
    if (!_sum.empty() && !other._sum.empty())
        _sum.front().add(other._sum.front());
    for (const Slot& each : other._slots) {
        if (each.count == 0)
            continue;
        if (!_sum.empty() && other._sum.empty())
            _sum.front().add(std::bit_cast<double>(each.key), each.count);
        insert(coarse(each.key), each.count);
    }
}

std::optional<double> ValueCounts::mean() const {
    ExactSum sum;
    if (!_sum.empty())
        sum = _sum.front();
    else
        for (const Slot& each : _slots)
            if (each.count != 0)
                sum.add(std::bit_cast<double>(each.key), each.count);
    const double mean = sum.value() / static_cast<double>(_count);
    return std::isfinite(mean) ? std::optional(mean) : std::nullopt;
}

std::vector<ValueCounts::Entry> ValueCounts::sorted() const {
    std::vector<Entry> entries;
    entries.reserve(_used);
    for (const Slot& each : _slots)
        if (each.count != 0)
            entries.push_back({valueOf(each.key), each.count});
    std::sort(entries.begin(), entries.end(),
              [](const Entry& a, const Entry& b) { return a.value < b.value; });
    return entries;
}

double ValueCounts::relativeError() const {
    if (_coarseness == 0)
        return 0;
    return _coarseness <= fractionBits
               ? std::ldexp(1.0, static_cast<int>(_coarseness) - static_cast<int>(fractionBits) - 1)
               : std::numeric_limits<double>::infinity();
}

double percentileOf(const std::vector<ValueCounts::Entry>& sorted, std::uint64_t count, unsigned percent) {
    // In whole numbers: percent / 100 of the count, rounded up, and at least the first.
    const std::uint64_t rank =
        std::max<std::uint64_t>(1, count / 100 * percent + (count % 100 * percent + 99) / 100);
    std::uint64_t below = 0;
    for (const ValueCounts::Entry& each : sorted) {
        below += each.count;
        if (below >= rank)
            return each.value;
    }
    return sorted.back().value;
}

} // namespace velmora
