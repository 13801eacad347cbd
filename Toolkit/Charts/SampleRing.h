// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/Sample.h"

#include <cstddef>
#include <deque>
#include <memory>
#include <optional>

namespace velmora {

class SampleBlock;
class SamplePool;

/// The samples of one series in the order of time, with gaps where there was no value. Made by a
/// `SampleStore`, whose memory it shares: when that is used up the oldest entries of the longest series go,
/// 1024 at a time. Appending takes constant time, lookup by time the logarithm of the number of entries.
/// Not thread-safe.
///
/// There is a gap where one was appended, and between two samples that are further apart than the gap limit:
/// a value counts from its time until the next entry, but never for longer than the limit.
class SampleRing {
public:
    ~SampleRing();
    SampleRing(const SampleRing&) = delete;
    SampleRing& operator=(const SampleRing&) = delete;

    /// Adds a value. False, and nothing is stored, for a time before the newest entry's and for a value that
    /// is not finite. Several values at the same time are all kept.
    bool append(std::int64_t time_ns, double value);
    /// Says that there is no value from then on. False as for a value.
    bool appendGap(std::int64_t time_ns);
    /// Removes everything, as after a jump back in time.
    void clear();

    [[nodiscard]] std::int64_t gapLimit_ns() const { return _gapLimit_ns; }
    /// Entries, gaps included.
    [[nodiscard]] std::size_t size() const { return _size; }
    /// The entry of that index, from the oldest; its value is NaN where a gap begins. `index` < `size`.
    [[nodiscard]] Sample entry(std::size_t index) const;
    /// How many entries are before the time, or - with `orAt` - before or at it.
    [[nodiscard]] std::size_t countBefore(std::int64_t time_ns, bool orAt = false) const;

    /// The sample that counts at that time, as it was appended; none in a gap, before the first sample and
    /// later than the gap limit after the last.
    [[nodiscard]] std::optional<Sample> at(std::int64_t time_ns) const;
    /// The nearest sample before and after the time, over any gaps.
    [[nodiscard]] std::optional<Sample> before(std::int64_t time_ns) const;
    [[nodiscard]] std::optional<Sample> after(std::int64_t time_ns) const;
    /// Of the values with times from `begin_ns` to before `end_ns`.
    [[nodiscard]] Extremes extremes(std::int64_t begin_ns, std::int64_t end_ns) const;
    /// Of the entries from `begin` to before `end`.
    [[nodiscard]] Extremes extremesOfEntries(std::size_t begin, std::size_t end) const;
    /// The gaps between samples with times from `begin_ns` to before `end_ns`, not those at its ends.
    [[nodiscard]] std::size_t gapCount(std::int64_t begin_ns, std::int64_t end_ns) const;
    /// Whether no line joins an entry and the one after it.
    [[nodiscard]] bool isGapAfter(std::size_t index) const;

    [[nodiscard]] std::optional<std::int64_t> oldest_ns() const;
    [[nodiscard]] std::optional<std::int64_t> newest_ns() const;
    /// Another number after each change.
    [[nodiscard]] std::uint64_t revision() const { return _revision; }

private:
    friend class SamplePool;
    friend class SampleStore;
    SampleRing(std::shared_ptr<SamplePool> pool, std::int64_t gapLimit_ns);
    bool add(std::int64_t time_ns, double value);

    std::shared_ptr<SamplePool> _pool;
    std::deque<std::unique_ptr<SampleBlock>> _blocks; ///< all full but the last
    std::int64_t _gapLimit_ns;
    std::size_t _size = 0;
    std::uint64_t _revision = 0;
};

} // namespace velmora
