// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/NumberFigures.h"
#include "Tests/Analysis/Statistics/StatisticsFixture.h"

#include <gtest/gtest.h>

#include <rapidcheck/gtest.h>

#include <algorithm>
#include <cmath>
#include <random>

// What holds of statistics whatever the values are.

namespace velmora {
namespace {

/// Values of which many are the same, and others differ by orders of magnitude.
rc::Gen<double> anyValue() {
    return rc::gen::oneOf(
        rc::gen::map(rc::gen::inRange(-560, -160), [](int quarters) { return quarters / 4.0; }),
        rc::gen::map(rc::gen::pair(rc::gen::inRange(-1000000, 1000000), rc::gen::inRange(-40, 40)),
                     [](const auto& pair) { return std::ldexp(pair.first, pair.second); }));
}

rc::Gen<std::vector<double>> anyValues() {
    return rc::gen::nonEmpty(rc::gen::container<std::vector<double>>(anyValue()));
}

ValueCounts countsOf(const std::vector<double>& values, std::size_t most) {
    ValueCounts counts(most);
    for (const double value : values)
        counts.add(value);
    return counts;
}

bool areSame(const ValueCounts& a, const ValueCounts& b) {
    const auto first = a.sorted();
    const auto second = b.sorted();
    return a.count() == b.count() && a.minimum() == b.minimum() && a.maximum() == b.maximum() &&
           a.mean() == b.mean() && a.relativeError() == b.relativeError() &&
           std::equal(first.begin(), first.end(), second.begin(), second.end(),
                      [](const auto& x, const auto& y) { return x.value == y.value && x.count == y.count; });
}

RC_GTEST_PROP(ValueCountsProperty, DoesNotDependOnTheOrder, ()) {
    std::vector<double> values = *anyValues();
    const std::size_t most = *rc::gen::inRange<std::size_t>(2, 50);
    const ValueCounts counts = countsOf(values, most);
    std::shuffle(values.begin(), values.end(), std::mt19937(*rc::gen::arbitrary<unsigned>()));
    RC_ASSERT(areSame(counts, countsOf(values, most)));
}

RC_GTEST_PROP(ValueCountsProperty, PartsMakeTheWhole, ()) {
    const std::vector<double> values = *anyValues();
    const std::size_t most = *rc::gen::inRange<std::size_t>(2, 50);
    const auto cut = static_cast<std::ptrdiff_t>(*rc::gen::inRange<std::size_t>(0, values.size() + 1));
    ValueCounts first = countsOf({values.begin(), values.begin() + cut}, most);
    first.add(countsOf({values.begin() + cut, values.end()}, most));
    RC_ASSERT(areSame(first, countsOf(values, most)));
}

RC_GTEST_PROP(ValueCountsProperty, FiguresAreThoseOfTheSortedValues, ()) {
    std::vector<double> values = *anyValues();
    const NumberFigures figures(countsOf(values, *rc::gen::element<std::size_t>(64, ValueCounts::usualMost)));
    std::sort(values.begin(), values.end());
    RC_ASSERT(figures.samples == values.size());
    RC_ASSERT(figures.minimum == values.front());
    RC_ASSERT(figures.maximum == values.back());
    for (const auto& [percent, figure] :
         {std::pair(5.0, figures.p5), {50.0, figures.p50}, {95.0, figures.p95}}) {
        const auto rank =
            static_cast<std::size_t>(std::ceil(percent * static_cast<double>(values.size()) / 100));
        const double exact = values[rank - 1];
        RC_ASSERT(figure.has_value());
        RC_ASSERT(std::fabs(*figure - exact) <= std::fabs(exact) * figures.relativeError);
    }
}

/// A drive: steps of time, levels and states.
std::vector<TestMessage> anyMessages() {
    const auto steps = *rc::gen::container<std::vector<std::tuple<int, int, int>>>(
        rc::gen::tuple(rc::gen::inRange(-2500, 40000), rc::gen::inRange(-120, -40), rc::gen::inRange(0, 5)));
    std::vector<TestMessage> messages;
    double seconds = 1000;
    for (const auto& [milliseconds, level, state] : steps) {
        seconds += milliseconds / 1000.0;
        TestMessage& message = messages.emplace_back(TestMessage{after(seconds)});
        if (state < 3)
            message.texts["/State"] = std::string(1, static_cast<char>('A' + state));
        else if (state == 3)
            message.absent = {"/State"};
        message.numbers["/Level"] = level;
    }
    return messages;
}

/// Samples and times of all groups together, by state.
std::map<std::string, std::pair<std::uint64_t, std::int64_t>>
totals(StatisticsPlan::By by, const std::vector<TestMessage>& messages) {
    TestStatistics statistics({by, {}});
    std::map<std::string, std::pair<std::uint64_t, std::int64_t>> sums;
    statistics.complete = [&](const GroupStatistics& group) {
        for (const auto& leaf : group.parts.front()->leaves) {
            if (!leaf)
                continue;
            sums["numbers"].first += leaf->numbers.count();
            for (const StateCounts::Value& value : leaf->states.values()) {
                sums[value.text].first += value.samples;
                sums[value.text].second += value.time.count();
            }
            sums["transitions"].first += leaf->states.transitionCount();
        }
    };
    for (const TestMessage& message : messages)
        statistics.report(message);
    statistics.finish();
    return sums;
}

RC_GTEST_PROP(StatisticsProperty, GroupsAddUpToTheWhole, ()) {
    const std::vector<TestMessage> messages = anyMessages();
    const auto whole = totals(StatisticsPlan::By::Nothing, messages);
    RC_ASSERT(totals(StatisticsPlan::By::Minute, messages) == whole);
    RC_ASSERT(totals(StatisticsPlan::By::Technology, messages) == whole);
}

RC_GTEST_PROP(StatisticsProperty, AFileThatIsCutInTwoIsTheWhole, ()) {
    std::vector<TestMessage> messages = anyMessages();
    const auto whole = totals(StatisticsPlan::By::Nothing, messages);
    const std::size_t cut = *rc::gen::inRange<std::size_t>(0, messages.size() + 1);
    for (std::size_t i = cut; i < messages.size(); ++i)
        messages[i].input = 1;
    RC_ASSERT(totals(StatisticsPlan::By::Nothing, messages) == whole);
    RC_ASSERT(totals(StatisticsPlan::By::File, messages) == whole);
}

RC_GTEST_PROP(StatisticsProperty, AShiftOfAllTimesChangesNothing, ()) {
    std::vector<TestMessage> messages = anyMessages();
    const auto before = totals(StatisticsPlan::By::Nothing, messages);
    const std::chrono::milliseconds shift(*rc::gen::inRange(-100000000, 100000000));
    for (TestMessage& message : messages)
        message.time += shift;
    RC_ASSERT(totals(StatisticsPlan::By::Nothing, messages) == before);
}

} // namespace
} // namespace velmora
