// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/SampleRing.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Colours of lines and bands, by number: each has a light and a dark form, with a contrast of at least 3:1
/// to the ground.
enum class ChartColor { first, second, third, fourth, fifth, sixth };

/// What distinguishes lines besides their colours. Where samples are so dense that dashes would hide some,
/// the line's marks do: a circle, a square or a triangle every now and then; solid lines have none.
enum class ChartLine { solid, dashed, dotted, dashDotted };

/// One line of a panel.
struct ChartSeries {
    std::string name; ///< "Serving, LTE"
    std::shared_ptr<const SampleRing> samples;
    ChartColor color = ChartColor::first;
    ChartLine line = ChartLine::solid;
    bool isStepped = false; ///< a value holds until the next (a channel number), instead of a slope to it
};

/// A level line across a panel: where "good" begins, say.
struct ChartLimit {
    double value = 0;
    std::string label;
};

/// One plot with its own axis of values. The plots of a `ChartView` share the axis of time.
struct ChartPanel {
    std::string title; ///< "Level"
    std::string unit;  ///< "dBm"; may be empty
    int decimals = 0;  ///< that values are written with, 0 to 9
    std::vector<ChartSeries> series;
    std::vector<ChartLimit> limits;
    /// The ends of the axis of values; where not given, what is in view.
    std::optional<double> minimum;
    std::optional<double> maximum;
};

/// A time during which something held, drawn above the panels: a radio technology, a state. Bands of a lane
/// do not overlap; without an `end_ns` the band lasts.
struct ChartBand {
    std::size_t lane = 0; ///< 0 is the topmost, at most 3
    std::int64_t begin_ns = 0;
    std::optional<std::int64_t> end_ns;
    std::string label; ///< "LTE"
    ChartColor color = ChartColor::first;
    friend bool operator==(const ChartBand&, const ChartBand&) = default;
};

/// How grave an event is, or that it is a note of the user's. Each has its own mark besides its colour.
enum class ChartSeverity { info, note, warning, critical };

/// An event, drawn as a line through all panels with its mark at the top.
struct ChartTick {
    std::int64_t time_ns = 0;
    ChartSeverity severity = ChartSeverity::info;
    std::string text; ///< "Handover to 1650/23"
    friend bool operator==(const ChartTick&, const ChartTick&) = default;
};

/// A series' value at a moment.
struct ChartReading {
    std::string panel;
    std::string series;
    std::optional<Sample> sample; ///< the sample that counts then; none in a gap
    std::string text;             ///< "−97.25 dBm" or "no value"
};

} // namespace velmora
