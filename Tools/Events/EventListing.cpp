// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/EventListing.h"

#include "Tools/Events/EventAnalysis.h"
#include "Tools/Events/EventLines.h"
#include "Tools/Events/EventRows.h"
#include "Tools/Events/EventText.h"
#include "Tools/ExitStatus.h"

#include <chrono>
#include <utility>

namespace velmora {

EventListing::EventListing(const EventsOptions& options, const RuleSet& rules, Output& output,
                           std::function<bool()> isInterrupted)
    : _options(options), _output(output), _names{options.files}, _writer(makeWriter()) {
    if (!options.program.empty()) {
        EventPrograms::Setup setup;
        setup.arguments = options.program;
        setup.limit = std::chrono::duration_cast<std::chrono::nanoseconds>(
            std::chrono::duration<double>(options.programLimit_seconds));
        setup.waits = !options.files.empty();
        setup.isInterrupted = std::move(isInterrupted);
        _programs.emplace(std::move(setup), _names);
    }
    _list.emplace(options, *_writer, programs());
    _feed.emplace(options.clock, [this, &rules](const Catalogue& catalogue) {
        auto analysis = std::make_unique<EventAnalysis>(catalogue, *_list);
        analysis->add(makeRuleDetector(rules, catalogue));
        return analysis;
    });
    _list->setFeed(*_feed);
    // Fixes have times of arrival.
    const bool showsPlaces = _options.format != EventsOptions::Format::Text || _options.hasPositions;
    if (showsPlaces && !_options.files.empty() && _options.clock == AnalysisClock::Arrival)
        _list->setPlaces(&_places.emplace(_options.maximumGap));
    _writer->begin();
}

std::unique_ptr<EventWriter> EventListing::makeWriter() {
    switch (_options.format) {
    case EventsOptions::Format::JsonLines: return std::make_unique<EventLines>(_output, _names);
    case EventsOptions::Format::Csv: return std::make_unique<EventRows>(_output, _names, _options.guard);
    case EventsOptions::Format::Text: break;
    }
    return std::make_unique<EventText>(_output, _names,
                                       EventText::Columns{_options.hasEvidence, _options.hasPositions},
                                       [this] { return _feed && _feed->technologies() > 1; });
}

bool EventListing::isDone() const {
    return !_output.isOpen() && !_programs && !_options.failOn;
}

void EventListing::finish() {
    _feed->finish();
    _list->finish();
    _writer->flush();
    if (_programs)
        _programs->finish();
}

int EventListing::status(bool good) const {
    if (!good || _output.state() == Output::State::Failed || (_programs && _programs->hasFailed()))
        return ExitStatus::BadInput;
    const std::optional<Severity> greatest = _list->greatest();
    return _options.failOn && greatest && *greatest >= *_options.failOn ? ExitStatus::Severe
                                                                        : ExitStatus::Done;
}

} // namespace velmora
