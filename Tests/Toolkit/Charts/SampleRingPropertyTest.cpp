// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// A ring against a plain list of everything that was appended, over random operations.

#include "Toolkit/Charts/SampleBlock.h"
#include "Toolkit/Charts/SampleColumns.h"
#include "Toolkit/Charts/SampleStore.h"

#include <gtest/gtest.h>

#include <rapidcheck/gtest.h>

#include <cmath>
#include <limits>
#include <vector>

namespace velmora {
namespace {

constexpr std::int64_t gapLimit = 20;

/// The same without blocks, pyramid and binary search.
struct PlainSeries {
    std::vector<Sample> entries;

    [[nodiscard]] std::optional<Sample> at(std::int64_t time) const {
        std::optional<Sample> last;
        for (const Sample& entry : entries)
            if (entry.time_ns <= time)
                last = entry;
        if (last && (std::isnan(last->value) || time - last->time_ns > gapLimit))
            last.reset();
        return last;
    }
    [[nodiscard]] Extremes extremes(std::int64_t begin, std::int64_t end) const {
        Extremes result;
        for (const Sample& entry : entries)
            if (entry.time_ns >= begin && entry.time_ns < end && !std::isnan(entry.value)) {
                result.minimum = std::min(result.minimum, entry.value);
                result.maximum = std::max(result.maximum, entry.value);
            }
        return result;
    }
    /// The nearest sample on one side.
    [[nodiscard]] std::optional<Sample> beside(std::int64_t time, bool isAfter) const {
        std::optional<Sample> result;
        for (const Sample& entry : entries) {
            if (std::isnan(entry.value) || (isAfter ? entry.time_ns <= time : entry.time_ns >= time))
                continue;
            if (!result || !isAfter)
                result = entry;
            if (isAfter)
                break;
        }
        return result;
    }
};

/// Appends random steps of time, values and gaps, the same to both, in runs long enough to fill blocks.
void fill(SampleRing& ring, PlainSeries& plain) {
    std::int64_t time = 0;
    const auto runs = *rc::gen::container<std::vector<std::pair<int, int>>>(
        rc::gen::pair(rc::gen::inRange(0, 40), rc::gen::inRange(1, 700)));
    for (const auto& [step, length] : runs)
        for (int number = 0; number < length; ++number) {
            time += number % 7 == 0 ? step : step % 3;
            if (step % 10 == 9 && number % 50 == 0) {
                RC_ASSERT(ring.appendGap(time));
                if (plain.entries.empty() || !std::isnan(plain.entries.back().value))
                    plain.entries.push_back({time, std::numeric_limits<double>::quiet_NaN()});
            } else {
                const double value = (step * 31 + number * 17) % 201 - 100;
                RC_ASSERT(ring.append(time, value));
                plain.entries.push_back({time, value});
            }
        }
}

RC_GTEST_PROP(SampleRings, AnswerAsAPlainListWouldOfWhatTheyStillHold, ()) {
    const auto blocks = *rc::gen::inRange<std::size_t>(1, 6);
    SampleStore store(blocks * (sizeof(SampleBlock) + 3 * sizeof(void*)));
    const auto ring = store.makeSeries(gapLimit);
    PlainSeries plain;
    fill(*ring, plain);
    RC_ASSERT(store.byteCount() <= blocks * (sizeof(SampleBlock) + 3 * sizeof(void*)));
    // Only the oldest are dropped, and no more than has to be.
    RC_ASSERT(ring->size() <= plain.entries.size());
    RC_ASSERT(ring->size() >= std::min(plain.entries.size(), (blocks - 1) * SampleBlock::capacity));
    plain.entries.erase(plain.entries.begin(),
                        plain.entries.end() - static_cast<std::ptrdiff_t>(ring->size()));
    for (std::size_t index = 0; index < ring->size(); ++index)
        RC_ASSERT(ring->entry(index).time_ns == plain.entries[index].time_ns);

    const std::int64_t last = ring->newest_ns().value_or(0);
    for (int trial = 0; trial < 20; ++trial) {
        const auto time = *rc::gen::inRange<std::int64_t>(-2, last + 50);
        const auto end = time + *rc::gen::inRange<std::int64_t>(0, last + 50);
        RC_ASSERT(ring->at(time) == plain.at(time));
        RC_ASSERT(ring->before(time) == plain.beside(time, false));
        RC_ASSERT(ring->after(time) == plain.beside(time, true));
        RC_ASSERT(ring->extremes(time, end) == plain.extremes(time, end));
    }
}

RC_GTEST_PROP(SampleColumns, HaveTheExtremesOfTheirTimes, ()) {
    SampleStore store;
    const auto ring = store.makeSeries(gapLimit);
    PlainSeries plain;
    fill(*ring, plain);
    const auto begin = *rc::gen::inRange<std::int64_t>(-100, 1000);
    const auto length = *rc::gen::inRange<std::int64_t>(1, 300);
    std::vector<SampleColumn> columns;
    reduceToColumns(*ring, begin, length, 20, columns);
    for (std::int64_t column = 0; column < 20; ++column)
        RC_ASSERT(columns[static_cast<std::size_t>(column)].extremes ==
                  plain.extremes(begin + column * length, begin + (column + 1) * length));
}

} // namespace
} // namespace velmora
