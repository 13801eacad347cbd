// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"
#include "Analysis/Tracks/Geodesy.h"
#include "Tools/Output.h"
#include "Tools/Text/TextBuffer.h"
#include "Tools/Text/TimeText.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Whether an event that lasts has only begun.
enum class EventState : bool { Begins, Complete };

/// "begins", "complete".
[[nodiscard]] std::string_view nameOf(EventState state);

/// How events name the messages that made them.
struct EvidenceNames {
    std::vector<std::string> files; ///< by input; none for the service
    /// The file's name; empty for the service.
    [[nodiscard]] std::string_view fileOf(const MessageNumber& message) const {
        return message.input < files.size() ? std::string_view(files[message.input]) : std::string_view();
    }
};

/// Writes events in one of the formats, a line each, into the output's buffer.
class EventWriter {
public:
    explicit EventWriter(Output& output) : _output(output) {}
    virtual ~EventWriter() = default;
    EventWriter(const EventWriter&) = delete;
    EventWriter& operator=(const EventWriter&) = delete;

    /// Before the first event.
    virtual void begin() {}
    /// `place`: where the event happened or began, if that is known.
    void write(const Event& event, EventState state, const std::optional<Coordinates>& place = {}) {
        _place = place;
        append(event, state);
        _output.put(_line.view());
        _line.clear();
    }
    void flush() { _output.flush(); }

protected:
    /// Appends the event's line.
    virtual void append(const Event& event, EventState state) = 0;
    [[nodiscard]] TextBuffer& line() { return _line; }
    /// The event's.
    [[nodiscard]] const std::optional<Coordinates>& place() const { return _place; }
    void appendTime(Time time) { _time.append(_line, time); }
    void put(std::string_view text) { _output.put(text); }

private:
    Output& _output;
    TextBuffer _line;
    TimeText _time;
    std::optional<Coordinates> _place;
};

} // namespace velmora
