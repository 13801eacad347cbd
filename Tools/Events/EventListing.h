// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/RuleSet.h"
#include "Analysis/Tracks/PlaceHistory.h"
#include "Tools/Analysed/AnalysisFeed.h"
#include "Tools/Events/EventList.h"
#include "Tools/Events/EventWriter.h"
#include "Tools/Events/EventsOptions.h"
#include "Tools/Events/Programs/EventPrograms.h"
#include "Tools/Output.h"

#include <functional>
#include <memory>
#include <optional>

namespace velmora {

/// The listing of events from messages to lines and programs. Main thread only.
class EventListing {
public:
    /// `isInterrupted`: whether waiting for programs is to end. Options, rules and output must outlive it.
    EventListing(const EventsOptions& options, const RuleSet& rules, Output& output,
                 std::function<bool()> isInterrupted);
    EventListing(const EventListing&) = delete;
    EventListing& operator=(const EventListing&) = delete;

    /// What the messages are passed to.
    [[nodiscard]] AnalysisFeed& feed() { return *_feed; }
    /// Null where none are to be run.
    [[nodiscard]] EventPrograms* programs() { return _programs ? &*_programs : nullptr; }
    /// Where the fixes of the messages go; null where no position is listed.
    [[nodiscard]] PlaceHistory* places() { return _places ? &*_places : nullptr; }
    /// Writes out what is complete.
    void flush() { _writer->flush(); }
    /// Whether no further event can matter: the reader has closed the output, and nothing else asks for them.
    [[nodiscard]] bool isDone() const;
    /// There are no more messages. Waits for the programs.
    void finish();
    /// The exit status. `good`: all of the input was read.
    [[nodiscard]] int status(bool good) const;

private:
    [[nodiscard]] std::unique_ptr<EventWriter> makeWriter();

    const EventsOptions& _options;
    Output& _output;
    EvidenceNames _names;
    std::unique_ptr<EventWriter> _writer;
    std::optional<EventPrograms> _programs;
    std::optional<PlaceHistory> _places;
    std::optional<EventList> _list;
    std::optional<AnalysisFeed> _feed;
};

} // namespace velmora
