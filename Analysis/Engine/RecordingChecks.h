// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/EventSink.h"
#include "Analysis/MessageReport.h"

#include <chrono>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// Finds what is not right with the recording itself: silence, a clock that jumps, malformed messages.
class RecordingChecks {
public:
    /// A longer silence is a gap.
    static constexpr std::chrono::seconds longestSilence{30};
    /// Messages may arrive out of order by so much.
    static constexpr std::chrono::seconds greatestDisorder{1};

    /// `technology` must be valid for as long as this.
    RecordingChecks(std::string_view technology, EventSink& sink) : _technology(technology), _sink(sink) {}

    /// Whether what was known before the message is not valid any more.
    [[nodiscard]] bool isInterruption(const MessageReport& report) const;
    /// The next message. Call it after what lasted until an interruption has been passed on.
    void report(const MessageReport& report);
    /// The reader of the input found damage before that message.
    void damaged(MessageNumber message, std::string_view reason);
    /// The recording has a comment on that message, which is the latest.
    void noted(MessageNumber message, std::string_view text);
    void finish() { _last.reset(); }
    /// Continues after a message of that time.
    void continueFrom(Time last) { _last = Last{last, last, {}}; }

    /// Absent before the first message, and after the end of the input.
    [[nodiscard]] std::optional<Time> last() const {
        return _last ? std::optional(_last->time) : std::nullopt;
    }

private:
    struct Last {
        Time time;
        Time arrival;
        MessageNumber message;
    };

    [[nodiscard]] Event newEvent(std::string_view kind, Time time, MessageNumber message) const;
    void jumped(const MessageReport& report);
    void paused(const MessageReport& report);
    void malformed(Time time, MessageNumber message, std::string_view reason,
                   std::optional<std::uint32_t> code);

    std::string_view _technology;
    EventSink& _sink;
    std::optional<Last> _last;
};

} // namespace velmora
