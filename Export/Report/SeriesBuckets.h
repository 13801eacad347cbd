// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "Platform/Clock.h"

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <vector>

namespace velmora {

/// A series of values for a chart, of any length in bounded memory: buckets of time, each with its least and
/// greatest value, so that no extreme is lost. Once there are too many buckets, two become one. Times without
/// values take no buckets.
class SeriesBuckets {
public:
    struct Bucket {
        std::int64_t index; ///< its begin, in widths since 1970
        double minimum;
        double maximum;
        std::uint64_t count;
        MessageNumber minimumAt; ///< the first message that reported it
        MessageNumber maximumAt;
    };

    /// Wide enough for any screen, and fewer than a page takes.
    static constexpr std::size_t usualMost = 6144;
    static constexpr std::chrono::nanoseconds narrowest = std::chrono::milliseconds(125);

    /// `most`: at least 2.
    explicit SeriesBuckets(std::size_t most = usualMost) : _most(most) {}

    void add(Time time, double value, MessageNumber message) {
        // Most values are of the latest bucket, which takes no division to see.
        if (time < _begin || time >= _end)
            begin(time);
        addTo(_buckets.back(), {0, value, value, 1, message, message});
    }
    /// Sorts what was added. Call it before `buckets`.
    void finish();

    [[nodiscard]] const std::vector<Bucket>& buckets() const { return _buckets; }
    [[nodiscard]] std::chrono::nanoseconds width() const { return _width; }
    [[nodiscard]] bool isEmpty() const { return _buckets.empty(); }
    /// Of all buckets in one. Precondition: there is one.
    [[nodiscard]] Bucket total() const;

private:
    [[nodiscard]] std::int64_t indexOf(Time time) const;
    /// The bucket of that time is the latest one.
    void begin(Time time);
    void join();
    static void addTo(Bucket& bucket, const Bucket& other);

    std::size_t _most;
    std::chrono::nanoseconds _width = narrowest;
    Time _begin{}; ///< of the latest bucket; as its end where there is none
    Time _end{};
    std::vector<Bucket> _buckets; ///< in the order of the messages; a clock may go back
};

} // namespace velmora
