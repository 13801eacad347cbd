// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/StateBand.h"

#include "Analysis/Statistics/ClockMinute.h"

#include <utility>

namespace velmora {

void StateBand::set(Time time, std::optional<std::string_view> value) {
    if (_steps.empty() ? !value : value == _values[_steps.back().value] && _steps.back().value != unknown)
        return;
    const std::uint32_t number = value ? numberOf(*value) : unknown;
    if (!_steps.empty() && _steps.back().value == number)
        return;
    if (_steps.size() >= _most)
        coarsen();
    _steps.push_back({time, number});
}

std::uint32_t StateBand::numberOf(std::string_view value) {
    if (const auto found = _numbers.find(value); found != _numbers.end())
        return found->second;
    if (_values.size() >= mostValues)
        return several;
    const auto number = static_cast<std::uint32_t>(_values.size());
    _values.emplace_back(value);
    _numbers.emplace(value, number);
    return number;
}

void StateBand::rename(std::string_view value, std::string name) {
    if (const auto found = _numbers.find(value); found != _numbers.end())
        _values[found->second] = std::move(name);
}

/// Joins what is shorter than some time, until half of the steps are left.
void StateBand::coarsen() {
    joinShort();
    while (_steps.size() > _most / 2 && _shortest < std::chrono::nanoseconds::max() / 4) {
        _shortest *= 2;
        joinShort();
    }
}

void StateBand::joinShort() {
    std::size_t kept = 0;
    for (std::size_t i = 0; i < _steps.size(); ++i) {
        Step step = _steps[i];
        if (i + 1 < _steps.size() && durationBetween(step.since, _steps[i + 1].since) < _shortest)
            step.value = several;
        if (kept == 0 || _steps[kept - 1].value != step.value)
            _steps[kept++] = step;
    }
    _steps.resize(kept);
}

} // namespace velmora
