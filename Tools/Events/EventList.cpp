// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/EventList.h"

namespace velmora {

EventList::EventList(const EventsOptions& options, EventWriter& writer, EventPrograms* programs)
    : _options(options), _writer(writer), _programs(programs),
      _order([this](const Event& event, const std::optional<Coordinates>& place) {
          list(event, EventState::Complete, place);
      }) {}

void EventList::began(const Event& event) {
    if (_options.isLive && _options.selection.containsBegin(event, first(event)))
        list(event, EventState::Begins, placeOf(event));
}

void EventList::happened(const Event& event) {
    if (!_options.selection.contains(event, first(event)))
        return;
    if (_options.isLive)
        list(event, EventState::Complete, placeOf(event));
    else
        _order.add(event, placeOf(event));
}

std::optional<Coordinates> EventList::placeOf(const Event& event) const {
    const std::optional<Position> position = _places ? _places->at(event.time) : std::nullopt;
    return position ? std::optional(Coordinates{position->fix.latitude, position->fix.longitude})
                    : std::nullopt;
}

void EventList::list(const Event& event, EventState state, const std::optional<Coordinates>& place) {
    if (!_greatest || event.severity > *_greatest)
        _greatest = event.severity;
    _writer.write(event, state, place);
    // The reader may be waiting for it.
    if (_options.isLive)
        _writer.flush();
    // Where the list is live, that of one that lasts has run at its begin.
    const bool hasRun = _options.isLive && event.lasts && state == EventState::Complete &&
                        _options.selection.containsBegin(event, first(event));
    if (_programs && !hasRun)
        _programs->run(event, state);
}

} // namespace velmora
