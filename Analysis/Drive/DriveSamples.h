// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/RadioTechnology.h"
#include "LogGenerator/Fields/Unit.h"
#include "Platform/Clock.h"

#include <cstddef>
#include <optional>
#include <string>

namespace velmora {

/// A series of numbers over time.
struct DriveSeries {
    std::string name; ///< "Serving cell", "Neighbour 1", "/GSM/GSM Serving Cell/C1"
    Unit unit = Unit::None;
    bool isPinned = false; ///< the user has pinned its row
};

/// The series that every drive has, by number. Neighbours are numbered by their level, the strongest first.
enum DriveSeriesNumber : std::size_t {
    servingLevelSeries,
    firstNeighbourLevelSeries,
    servingQualitySeries = firstNeighbourLevelSeries + 3,
    firstNeighbourQualitySeries,
    firstPinnedSeries = firstNeighbourQualitySeries + 3,
};
inline constexpr std::size_t chartedNeighbours = 3;

/// Gets the samples of a drive. Each is an observed value, at the time of its message.
class DriveSamples {
public:
    virtual ~DriveSamples() = default;

    virtual void sample(std::size_t series, Time time, double value) = 0;
    /// From that time on the radio is in another technology or state; absent for unknown ones.
    virtual void changed(Time time, std::optional<RadioTechnology> technology,
                         std::optional<RadioMode> mode) = 0;
    /// All samples are forgotten.
    virtual void forgetAll() = 0;
    /// A series has been pinned: it is the last one now.
    virtual void pinned(const DriveSeries& series) = 0;
    /// A pinned series has been taken off; those after it move up.
    virtual void unpinned(std::size_t series) = 0;
};

} // namespace velmora
