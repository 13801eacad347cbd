// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Watch/WatchEvents.h"

#include "Platform/DateText.h"
#include "Platform/PrintableText.h"
#include "Tools/Events/EventAnalysis.h"
#include "Tools/LogOverride.h"

#include <memory>
#include <utility>

namespace velmora {

namespace {

/// A longer text would leave no room for the others.
constexpr std::size_t longestText = 200;

/// Discards the lines of decoding, which the display's decoder writes already.
class DiscardedLog final : public LogOverride {
public:
    void write(int, std::string_view) override {}
};

} // namespace

WatchEvents::WatchEvents(const RuleSet& rules, const Clock& clock, Changed changed)
    : _clock(clock), _changed(std::move(changed)),
      _feed(AnalysisClock::Arrival, [this, &rules](const Catalogue& catalogue) {
          EventSink& sink = *this;
          auto analysis = std::make_unique<EventAnalysis>(catalogue, sink);
          analysis->add(makeRuleDetector(rules, catalogue));
          return analysis;
      }) {}

void WatchEvents::setTechnology(std::string_view technology) {
    const DiscardedLog log;
    const Result<TechnologyFeed*> feed = _feed.of(std::string(technology));
    _technology = feed ? *feed : nullptr;
}

void WatchEvents::take(const Data& message) {
    if (!_technology)
        return;
    LoggedMessage logged;
    logged.time = _clock.now();
    logged.message = message;
    logged.number = ++_messages;
    const DiscardedLog log;
    // The display reports what cannot be decoded.
    static_cast<void>(_technology->decode(logged, 0));
}

std::string WatchEvents::line() const {
    std::string line;
    for (const std::string& each : _latest)
        line += (line.empty() ? "" : " \u00B7 ") + each;
    return line;
}

void WatchEvents::show(const Event& event, State state) {
    const Time time = state == State::Ended ? event.end.value_or(event.time) : event.time;
    std::string text = localDateAndTime(_clock, time, " ").substr(std::string_view("2026-11-16 ").size());
    text += state == State::Ended ? " ended: " : state == State::Begins ? " begins: " : " ";
    _latest.push_front(text + clipped(printable(event.text), longestText));
    if (_latest.size() > mostShown)
        _latest.pop_back();
    _changed(event, state != State::Ended);
}

} // namespace velmora
