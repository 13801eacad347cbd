// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/DriveHistory.h"

#include <chrono>
#include <cmath>

namespace velmora {

namespace {

using namespace std::chrono_literals;

/// Messages may arrive out of order by so much; what goes further back is a clock that was set.
constexpr std::int64_t greatestDisorder_ns = std::chrono::nanoseconds(1s).count();

template <class Enumeration>
ChartColor colorOf(Enumeration value) {
    return static_cast<ChartColor>(static_cast<std::size_t>(value) % 6);
}

int decimalsOf(double value) {
    const auto isWhole = [](double number) { return std::abs(number - std::round(number)) < 1e-6; };
    return isWhole(value) ? 0 : isWhole(value * 10) ? 1 : 2;
}

std::shared_ptr<SampleRing> makeRing(SampleStore& store, std::chrono::nanoseconds lifetime) {
    return store.makeSeries(lifetime.count());
}

} // namespace

DriveHistory::DriveHistory() {
    for (std::size_t i = 0; i < firstPinnedSeries; ++i)
        _series.push_back({makeRing(_store, valueLifetime)});
}

void DriveHistory::sample(std::size_t series, Time time, double value) {
    Series& found = _series[series];
    const std::int64_t time_ns = nanosecondsOf(time);
    if (!found.ring->append(time_ns, value)) {
        const auto newest = found.ring->newest_ns();
        if (!newest || *newest - time_ns <= greatestDisorder_ns)
            return;
        forgetAll();
        if (!found.ring->append(time_ns, value))
            return;
    }
    found.decimals = std::max(found.decimals, decimalsOf(value));
}

void DriveHistory::changed(Time time, std::optional<RadioTechnology> technology,
                           std::optional<RadioMode> mode) {
    const std::int64_t time_ns = nanosecondsOf(time);
    changeBand(0, time_ns, technology ? nameOf(*technology) : std::string_view(),
               colorOf(technology.value_or(RadioTechnology::GSM)));
    changeBand(1, time_ns, mode ? nameOf(*mode) : std::string_view(), colorOf(mode.value_or(RadioMode::Off)));
    if (technology)
        return;
    for (std::size_t i = 0; i < firstPinnedSeries; ++i)
        if (_series[i].ring->size() > 0)
            _series[i].ring->appendGap(time_ns);
}

void DriveHistory::changeBand(std::size_t lane, std::int64_t time_ns, std::string_view label,
                              ChartColor color) {
    std::vector<ChartBand>& bands = _bands[lane];
    const bool lasts = !bands.empty() && !bands.back().end_ns;
    if (lasts ? bands.back().label == label : label.empty())
        return;
    if (lasts)
        bands.back().end_ns = std::max(time_ns, bands.back().begin_ns);
    if (!label.empty())
        bands.push_back({lane, time_ns, {}, std::string(label), color});
    if (bands.size() > mostBands)
        bands.erase(bands.begin(), bands.begin() + mostBands / 4);
    ++_bandsRevision;
}

void DriveHistory::forgetAll() {
    for (Series& each : _series) {
        each.ring->clear();
        each.decimals = 0;
    }
    for (auto& lane : _bands)
        lane.clear();
    ++_bandsRevision;
}

void DriveHistory::pinned(const DriveSeries& /*series*/) {
    _series.push_back({makeRing(_store, pinnedLifetime)});
}

void DriveHistory::unpinned(std::size_t series) {
    _series.erase(_series.begin() + static_cast<std::ptrdiff_t>(series));
}

std::vector<ChartBand> DriveHistory::bands() const {
    std::vector<ChartBand> all = _bands[0];
    all.insert(all.end(), _bands[1].begin(), _bands[1].end());
    return all;
}

} // namespace velmora
