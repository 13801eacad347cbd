// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "Platform/Clock.h"
#include "PropertyLists/Value.h"
#include "Tools/Decode/Decoding.h"

#include <chrono>
#include <functional>
#include <map>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// When each leaf of the display was last reported, and the display without those for which that is too long
/// ago: a value stays on the screens until another replaces it, however old it is.
class FreshValues final : public ObservationSink {
public:
    explicit FreshValues(std::chrono::nanoseconds maximumAge) : _maximumAge(maximumAge) {}

    void observed(const ObservedMessage& message) override;

    /// The parts of the display that are at most that old: an empty list or dictionary where nothing of it
    /// is. None of no display. Shares with the display what is fresh as a whole.
    [[nodiscard]] Value of(const Value& display, const Catalogue& catalogue, Time now) const;

private:
    [[nodiscard]] bool isFresh(const CatalogueField* leaf, Time now) const;
    [[nodiscard]] Value part(const Value& value, const CatalogueNode& node, Time now) const;

    std::chrono::nanoseconds _maximumAge;
    std::vector<std::optional<Time>> _latest; ///< by the leaf's index in its catalogue
};

/// The limit for the age of what a file's displays show, technology by technology.
class AgeLimit {
public:
    /// Absent: there is no limit, and nothing is observed.
    explicit AgeLimit(std::optional<std::chrono::nanoseconds> maximumAge) : _maximumAge(maximumAge) {}

    /// Observes the decoder's messages, which must not outlive this.
    void watch(LogGenerator& decoder);
    /// What of the display is fresh at that time.
    [[nodiscard]] Value fresh(const Decoded& decoded, Time now) const;

private:
    struct Technology {
        FreshValues values;
        const Catalogue* catalogue;
    };

    std::optional<std::chrono::nanoseconds> _maximumAge;
    std::map<std::string, Technology, std::less<>> _technologies; ///< by their short names
};

} // namespace velmora
