// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Drive/DriveSamples.h"

#include <map>
#include <string>
#include <vector>

namespace velmora {

/// Keeps the samples that a drive model passes on.
class KeptSamples final : public DriveSamples {
public:
    struct Sample {
        Time time;
        double value;
    };
    struct Change {
        Time time;
        std::optional<RadioTechnology> technology;
        std::optional<RadioMode> mode;
    };

    void sample(std::size_t series, Time time, double value) override {
        samples[series].push_back({time, value});
    }
    void changed(Time time, std::optional<RadioTechnology> technology,
                 std::optional<RadioMode> mode) override {
        changes.push_back({time, technology, mode});
    }
    void forgetAll() override { samples.clear(), changes.clear(); }
    void pinned(const DriveSeries& series) override { pins.push_back(series.name); }
    void unpinned(std::size_t series) override {
        pins.erase(pins.begin() + static_cast<std::ptrdiff_t>(series - firstPinnedSeries));
    }

    std::map<std::size_t, std::vector<Sample>> samples;
    std::vector<Change> changes;
    std::vector<std::string> pins;
};

} // namespace velmora
