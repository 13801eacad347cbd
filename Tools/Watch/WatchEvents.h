// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/EventSink.h"
#include "Analysis/Rules/RuleSet.h"
#include "Platform/Clock.h"
#include "Tools/Analysed/AnalysisFeed.h"

#include <cstdint>
#include <deque>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// The latest events of what a watcher receives, as one line. Main thread only.
class WatchEvents final : private EventSink {
public:
    /// How many the line has, the latest first; a terminal shows those that it has room for.
    static constexpr std::size_t mostShown = 8;

    /// Called after each change of the line; `isNew`: the event is not the end of what has lasted.
    using Changed = std::function<void(const Event& event, bool isNew)>;

    /// Rules and clock must outlive it.
    WatchEvents(const RuleSet& rules, const Clock& clock, Changed changed);

    /// The technology of the messages that follow, by its constant or short name.
    void setTechnology(std::string_view technology);
    void take(const Data& message);
    /// The connection was lost.
    void interrupt() { _feed.interrupt(); }

    /// "05:01:20 no service · 05:01:12 handover from ..."; empty before the first event.
    [[nodiscard]] std::string line() const;

private:
    enum class State { Happened, Begins, Ended };

    void began(const Event& event) override { show(event, State::Begins); }
    void happened(const Event& event) override { show(event, event.lasts ? State::Ended : State::Happened); }
    void show(const Event& event, State state);

    const Clock& _clock;
    Changed _changed;
    AnalysisFeed _feed;
    TechnologyFeed* _technology = nullptr;
    std::uint64_t _messages = 0;
    std::deque<std::string> _latest; ///< the latest first
};

} // namespace velmora
