// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/EventSink.h"
#include "Analysis/Tracks/PlaceHistory.h"
#include "Tools/Analysed/AnalysisFeed.h"
#include "Tools/Events/EventOrder.h"
#include "Tools/Events/EventWriter.h"
#include "Tools/Events/EventsOptions.h"
#include "Tools/Events/Programs/EventPrograms.h"

#include <optional>

namespace velmora {

/// Lists the selected ones of the events that become known: sorted, or at once where the list is live.
class EventList final : public EventSink {
public:
    /// `programs` may be null. All must outlive it.
    EventList(const EventsOptions& options, EventWriter& writer, EventPrograms* programs);

    /// The feed whose messages make the events; before the first of them.
    void setFeed(const AnalysisFeed& feed) { _feed = &feed; }
    /// The places of the events, from before the first of them; null for none. Must outlive it.
    void setPlaces(const PlaceHistory* places) { _places = places; }
    void began(const Event& event) override;
    void happened(const Event& event) override;
    /// There are no more events.
    void finish() { _order.flush(); }

    /// The greatest severity of those that are listed.
    [[nodiscard]] std::optional<Severity> greatest() const { return _greatest; }

private:
    /// The time of the first message of all.
    [[nodiscard]] Time first(const Event& event) const { return _feed->first().value_or(event.time); }
    [[nodiscard]] std::optional<Coordinates> placeOf(const Event& event) const;
    void list(const Event& event, EventState state, const std::optional<Coordinates>& place);

    const EventsOptions& _options;
    EventWriter& _writer;
    EventPrograms* _programs;
    const AnalysisFeed* _feed = nullptr;
    const PlaceHistory* _places = nullptr;
    EventOrder _order;
    std::optional<Severity> _greatest;
};

} // namespace velmora
