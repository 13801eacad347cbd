// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Tracks/TrackData.h"

#include <cstddef>
#include <string>
#include <vector>

namespace velmora {

/// The colours of a track by its first attribute. Colour 0 is for points without a value. Numbers have five
/// classes of the same width, from the smallest to the largest; other values a colour each, further ones
/// again from the first on.
class TrackColours {
public:
    static constexpr std::size_t classes = 5;

    /// The track must outlive it.
    explicit TrackColours(const TrackData& track);

    [[nodiscard]] std::size_t count() const { return classes + 1; }
    [[nodiscard]] std::size_t of(const TrackData::Point& point) const;
    /// "level (dBm): -97 to -85.4"; the attribute's name for other values and for none.
    [[nodiscard]] std::string label(std::size_t colour) const;
    /// As KML has it: opacity, blue, green, red.
    [[nodiscard]] std::string colour(std::size_t colour) const;
    /// The name of the colour's style.
    [[nodiscard]] static std::string style(std::size_t colour) { return "class" + std::to_string(colour); }

private:
    [[nodiscard]] double boundary(std::size_t index) const;

    const TrackData& _track;
    bool _hasNumbers = false;
    double _least = 0;
    double _largest = 0;
    std::vector<std::string> _texts;
};

} // namespace velmora
