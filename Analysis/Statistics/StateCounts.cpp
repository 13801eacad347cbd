// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/StateCounts.h"

#include <utility>

namespace velmora {

std::size_t StateCounts::indexOf(const Observation& observation, ObservedText& texts) {
    if (_latest < _values.size() && _values[_latest].key.is(observation)) // as most are
        return _latest;
    for (std::size_t i = 0; i < _values.size(); ++i)
        if (_values[i].key.is(observation))
            return _latest = i;
    if (_values.size() == most)
        return others;
    return add(observation.kind == ObservedKind::Text
                   ? StateKey{observation.kind, 0, std::string(observation.words)}
                   : StateKey{observation.kind, observation.raw},
               texts.of(observation));
}

std::size_t StateCounts::indexOf(const Value& value) {
    for (std::size_t i = 0; i < _values.size(); ++i)
        if (_values[i].key == value.key)
            return i;
    return _values.size() == most ? others : add(value.key, value.text);
}

std::size_t StateCounts::add(StateKey key, std::string_view text) {
    _values.push_back({std::move(key), std::string(text)});
    return _values.size() - 1;
}

void StateCounts::add(const StateCounts& other) {
    std::vector<std::size_t> indexes;
    for (const Value& each : other._values) {
        const std::size_t index = indexOf(each);
        indexes.push_back(index);
        at(index).samples += each.samples;
        at(index).time += each.time;
    }
    indexes.resize(others + 1, others);
    _others.samples += other._others.samples;
    _others.time += other._others.time;
    for (const auto& [change, count] : other._transitions)
        _transitions[{indexes[change.first], indexes[change.second]}] += count;
}

std::uint64_t StateCounts::samples() const {
    std::uint64_t sum = _others.samples;
    for (const Value& each : _values)
        sum += each.samples;
    return sum;
}

std::uint64_t StateCounts::transitionCount() const {
    std::uint64_t sum = 0;
    for (const auto& [change, count] : _transitions)
        sum += count;
    return sum;
}

std::chrono::nanoseconds StateCounts::time() const {
    std::chrono::nanoseconds sum = _others.time;
    for (const Value& each : _values)
        sum += each.time;
    return sum;
}

} // namespace velmora
