// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"
#include "Platform/Fix.h"

#include <chrono>
#include <cstddef>
#include <optional>
#include <string>
#include <variant>
#include <vector>

namespace velmora {

/// What is written to a track file: a drive's fixes with the values that held there, and its events.
struct TrackData {
    using Value = std::variant<std::monostate, double, std::string>;

    struct Attribute {
        std::string name; ///< "level", or a path
        std::string unit; ///< empty for none
    };
    struct Point {
        Fix fix;
        std::vector<Value> values; ///< as many as there are attributes
    };
    struct PlacedEvent {
        Event event;
        std::optional<Fix> fix; ///< where it happened; absent where that is unknown
    };

    std::string name; ///< of the file that it is made of
    std::vector<Attribute> attributes;
    /// In the order of time, without gaps in each segment; none is empty.
    std::vector<std::vector<Point>> segments;
    std::vector<PlacedEvent> events;
};

/// Numbers of track files: the decimals alone that are needed, at most that many.
[[nodiscard]] std::string decimalText(double number, int decimals);
/// UTC with milliseconds where there are any: "2026-11-22T09:05:07.250Z".
[[nodiscard]] std::string trackTime(Time time);
/// A value as text; empty for none.
[[nodiscard]] std::string valueText(const TrackData::Value& value);
/// For character data and attributes of XML 1.0: escaped, and U+FFFD for what it cannot hold.
[[nodiscard]] std::string xmlText(std::string_view text);

} // namespace velmora
