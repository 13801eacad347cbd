// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "Platform/Clock.h"
#include "PropertyLists/Value.h"

#include <chrono>
#include <optional>
#include <vector>

namespace velmora {

/// When each leaf of the display was last reported, and the display without those for which that is too long
/// ago: a value stays on the screens until another replaces it, however old it is.
class FreshValues final : public ObservationSink {
public:
    explicit FreshValues(std::chrono::nanoseconds maximumAge) : _maximumAge(maximumAge) {}

    void observed(const ObservedMessage& message) override;

    /// The parts of the display that are at most that old: an empty list or dictionary where nothing of it is.
    /// None of no display. Shares with the display what is fresh as a whole.
    [[nodiscard]] Value of(const Value& display, const Catalogue& catalogue, Time now) const;

private:
    [[nodiscard]] bool isFresh(const CatalogueField* leaf, Time now) const;
    [[nodiscard]] Value part(const Value& value, const CatalogueNode& node, Time now) const;

    std::chrono::nanoseconds _maximumAge;
    std::vector<std::optional<Time>> _latest; ///< by the leaf's index in its catalogue
};

} // namespace velmora
