// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/SeriesBuckets.h"

#include <algorithm>
#include <limits>

namespace velmora {

namespace {

/// Rounded down for times before 1970 too.
std::int64_t quotient(std::int64_t dividend, std::int64_t divisor) {
    return dividend / divisor - (dividend % divisor < 0 ? 1 : 0);
}

} // namespace

std::int64_t SeriesBuckets::indexOf(Time time) const {
    return quotient(time.time_since_epoch().count(), _width.count());
}

void SeriesBuckets::begin(Time time) {
    std::int64_t index = indexOf(time);
    while (_buckets.size() >= _most) {
        // Buckets that are there twice, since a clock went back, are no reason to make them wider.
        join();
        if (_buckets.size() > _most / 2) {
            if (_width > std::chrono::nanoseconds::max() / 4) // wider than all times
                break;
            _width *= 2;
            for (Bucket& each : _buckets)
                each.index = quotient(each.index, 2);
            index = quotient(index, 2);
            join();
        }
    }
    if (_buckets.empty() || _buckets.back().index != index)
        _buckets.push_back({index,
                            std::numeric_limits<double>::infinity(),
                            -std::numeric_limits<double>::infinity(),
                            0,
                            {},
                            {}});
    std::int64_t first = 0;
    std::int64_t end = 0;
    // At the ends of all times, what is left of the bucket.
    const bool isCut = __builtin_mul_overflow(index, _width.count(), &first);
    _begin = isCut ? Time::min() : Time(std::chrono::nanoseconds(first));
    const bool isLast = __builtin_add_overflow(first, _width.count(), &end);
    _end = isCut || isLast ? time : Time(std::chrono::nanoseconds(end));
}

void SeriesBuckets::join() {
    const auto isEarlier = [](const Bucket& a, const Bucket& b) { return a.index < b.index; };
    if (!std::is_sorted(_buckets.begin(), _buckets.end(), isEarlier))
        std::stable_sort(_buckets.begin(), _buckets.end(), isEarlier);
    std::size_t kept = 0;
    for (const Bucket& each : _buckets) {
        if (kept != 0 && _buckets[kept - 1].index == each.index)
            addTo(_buckets[kept - 1], each);
        else
            _buckets[kept++] = each;
    }
    _buckets.resize(kept);
}

void SeriesBuckets::finish() {
    join();
}

SeriesBuckets::Bucket SeriesBuckets::total() const {
    Bucket total = _buckets.front();
    for (std::size_t i = 1; i < _buckets.size(); ++i)
        addTo(total, _buckets[i]);
    return total;
}

void SeriesBuckets::addTo(Bucket& bucket, const Bucket& other) {
    if (bucket.count == 0 || other.minimum < bucket.minimum ||
        (other.minimum == bucket.minimum && other.minimumAt < bucket.minimumAt)) {
        bucket.minimum = other.minimum;
        bucket.minimumAt = other.minimumAt;
    }
    if (bucket.count == 0 || other.maximum > bucket.maximum ||
        (other.maximum == bucket.maximum && other.maximumAt < bucket.maximumAt)) {
        bucket.maximum = other.maximum;
        bucket.maximumAt = other.maximumAt;
    }
    bucket.count += other.count;
}

} // namespace velmora
