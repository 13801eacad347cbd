// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Stats/StatisticsValues.h"

#include "Analysis/Statistics/Histogram.h"
#include "Tools/Text/TimeText.h"

#include <string>

namespace velmora {

namespace {

Value histogramValue(const ValueCounts& numbers, Unit unit) {
    const Histogram histogram = histogramOf(numbers.sorted(), unit);
    const ArrayRef bins = makeArray();
    for (const HistogramBin& each : histogram.bins) {
        const DictionaryRef bin = makeDictionary();
        if (each.from == each.to) {
            bin->set("value", numberValue(each.from));
        } else {
            bin->set("from", numberValue(each.from));
            bin->set("to", numberValue(each.to));
        }
        bin->set("samples", countValue(each.count));
        bins->append(bin);
    }
    const DictionaryRef object = makeDictionary();
    object->set("bins", bins);
    object->set("others", countValue(histogram.others));
    return object;
}

Value shareOf(std::chrono::nanoseconds part, std::chrono::nanoseconds whole) {
    if (whole.count() == 0)
        return {};
    return numberValue(static_cast<double>(part.count()) / static_cast<double>(whole.count()));
}

} // namespace

Value numberValue(const std::optional<double>& number) {
    constexpr double exact = 9007199254740992; // 2^53
    if (!number)
        return {};
    if (*number > -exact && *number < exact &&
        *number == static_cast<double>(static_cast<std::int64_t>(*number)))
        return Value(static_cast<std::int64_t>(*number));
    return Value(*number);
}

Value countValue(std::uint64_t count) {
    return Value(static_cast<std::int64_t>(count));
}

Value timeValue(Time time) {
    TextBuffer text;
    TimeText().append(text, time);
    return Value(text.view());
}

Value secondsValue(std::chrono::nanoseconds duration) {
    return numberValue(static_cast<double>(duration.count()) / 1e9);
}

Value stateValue(const StateCounts& states, std::size_t value) {
    if (value == StateCounts::others)
        return {};
    const StateKey& key = states.at(value).key;
    if (key.kind == ObservedKind::Text)
        return Value(key.words);
    return key.kind == ObservedKind::Flag ? Value(key.raw != 0) : Value(key.raw);
}

void setNumbers(Dictionary& object, const ValueCounts& numbers, Unit unit, bool hasHistogram) {
    const NumberFigures figures(numbers);
    object.set("samples", countValue(figures.samples));
    if (figures.samples == 0)
        return;
    object.set("minimum", numberValue(figures.minimum));
    object.set("p5", numberValue(figures.p5));
    object.set("p50", numberValue(figures.p50));
    object.set("p95", numberValue(figures.p95));
    object.set("maximum", numberValue(figures.maximum));
    object.set("mean", numberValue(figures.mean));
    if (figures.relativeError > 0)
        object.set("relativeError", numberValue(figures.relativeError));
    if (hasHistogram)
        object.set("histogram", histogramValue(numbers, unit));
}

void setStates(Dictionary& object, const StateCounts& states, bool isInList) {
    object.set("samples", countValue(states.samples()));
    const std::chrono::nanoseconds known = states.time();
    if (!isInList) {
        object.set("seconds", secondsValue(known));
        object.set("transitions", countValue(states.transitionCount()));
    }
    const ArrayRef values = makeArray();
    const auto add = [&](std::size_t index) {
        const StateCounts::Value& each = states.at(index);
        const DictionaryRef value = makeDictionary();
        value->set("value", stateValue(states, index));
        if (index == StateCounts::others)
            value->set("others", true);
        else
            value->set("text", each.text);
        value->set("samples", countValue(each.samples));
        if (!isInList) {
            value->set("seconds", secondsValue(each.time));
            value->set("share", shareOf(each.time, known));
        }
        values->append(value);
    };
    for (std::size_t i = 0; i < states.values().size(); ++i)
        add(i);
    if (states.hasOthers())
        add(StateCounts::others);
    object.set("values", values);
    if (isInList)
        return;
    const ArrayRef changes = makeArray();
    for (const auto& [change, count] : states.transitions()) {
        const DictionaryRef entry = makeDictionary();
        entry->set("from", stateValue(states, change.first));
        entry->set("to", stateValue(states, change.second));
        entry->set("count", countValue(count));
        changes->append(entry);
    }
    object.set("changes", changes);
}

Value worstMinuteValue(const RoleStatistics& role) {
    if (!role.worst)
        return {};
    const DictionaryRef object = makeDictionary();
    object->set("minute", timeValue(role.worst->begin));
    object->set("measure", role.measure == WorstMinute::Measure::HighestMean ? "mean" : "median");
    object->set("value", numberValue(role.worst->figure));
    object->set("samples", countValue(role.worst->samples));
    object->set("technology", role.worstTechnology);
    return object;
}

} // namespace velmora
