// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "Analysis/Statistics/CountedLeaves.h"
#include "Analysis/Statistics/LeafChoice.h"
#include "Export/Tracks/TrackData.h"
#include "LogGenerator/Observations/Observation.h"
#include "Platform/Clock.h"

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace velmora {

/// The chosen values of a recording with their times, of all its technologies: the attributes of its track.
/// Memory grows with their number.
class TrackSamples {
public:
    /// A value older than that is none of a place.
    static constexpr std::chrono::nanoseconds maximumAge = std::chrono::seconds(10);

    /// The choice must outlive it.
    explicit TrackSamples(const LeafChoice& choice) : _choice(choice) {}

    [[nodiscard]] const LeafChoice& choice() const { return _choice; }
    /// Adds what the choice names in the message. Of the rows of a list the first counts. `leaves` and
    /// `texts`: the technology's own.
    void add(const MessageReport& report, CountedLeaves& leaves, ObservedText& texts);

    [[nodiscard]] std::vector<TrackData::Attribute> attributes() const;
    /// The value of each attribute at that time: the latest one before.
    [[nodiscard]] std::vector<TrackData::Value> valuesAt(Time time) const;

private:
    struct Sample {
        Time time;
        TrackData::Value value;
    };
    struct Series {
        TrackData::Attribute attribute;
        std::uint64_t message = 0; ///< that the latest sample is of
        std::vector<Sample> samples;
    };

    [[nodiscard]] Series& seriesOf(const CatalogueField& leaf, const std::string& name);

    const LeafChoice& _choice;
    std::vector<Series> _series;
};

} // namespace velmora
