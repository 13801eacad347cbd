// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Tracks/TrackColours.h"

#include <algorithm>
#include <cmath>

namespace velmora {

namespace {

/// From dark to light, distinguishable without colours, too.
constexpr const char* colours[] = {"ff808080", "ff540144", "ff8b523b", "ff8c9021", "ff63c95d", "ff25e7fd"};

} // namespace

TrackColours::TrackColours(const TrackData& track) : _track(track) {
    for (const auto& segment : track.segments)
        for (const TrackData::Point& point : segment) {
            if (point.values.empty())
                continue;
            if (const auto* const number = std::get_if<double>(&point.values.front())) {
                _least = _hasNumbers ? std::min(_least, *number) : *number;
                _largest = _hasNumbers ? std::max(_largest, *number) : *number;
                _hasNumbers = true;
            } else if (const auto* const text = std::get_if<std::string>(&point.values.front());
                       text && _texts.size() < classes &&
                       std::find(_texts.begin(), _texts.end(), *text) == _texts.end()) {
                _texts.push_back(*text);
            }
        }
}

double TrackColours::boundary(std::size_t index) const {
    return std::lerp(_least, _largest, static_cast<double>(index) / classes);
}

std::size_t TrackColours::of(const TrackData::Point& point) const {
    if (point.values.empty())
        return 0;
    if (const auto* const number = std::get_if<double>(&point.values.front())) {
        std::size_t index = 1;
        while (index < classes && *number >= boundary(index))
            ++index;
        return index;
    }
    if (const auto* const text = std::get_if<std::string>(&point.values.front()))
        return 1 + static_cast<std::size_t>(std::find(_texts.begin(), _texts.end(), *text) - _texts.begin()) %
                       classes;
    return 0;
}

std::string TrackColours::label(std::size_t colour) const {
    if (_track.attributes.empty())
        return "track";
    const TrackData::Attribute& attribute = _track.attributes.front();
    const std::string name = attribute.name + (attribute.unit.empty() ? "" : " (" + attribute.unit + ")");
    if (colour == 0)
        return name + ": none";
    if (!_hasNumbers)
        return name + (colour <= _texts.size() ? ": " + _texts[colour - 1] : "");
    return name + ": " + decimalText(boundary(colour - 1), 2) + " to " + decimalText(boundary(colour), 2);
}

std::string TrackColours::colour(std::size_t colour) const {
    return colours[colour];
}

} // namespace velmora
