// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/MessageReader.h"
#include "Tools/Messages/TimeRange.h"

#include <cstdint>
#include <optional>
#include <utility>
#include <vector>

namespace velmora {

/// Which messages of a file a command takes, as its options say.
struct MessageSelection {
    TimeRange range;
    /// Messages before the start of the range are decoded without being written.
    bool isWarm = false;
    /// Only records of these log codes, as LogMessage::logCode returns them; empty for all messages.
    std::vector<std::uint32_t> codes;
};

/// Applies a selection to the messages of a file, which it gets from the first one on.
class MessageFilter {
public:
    explicit MessageFilter(MessageSelection selection)
        : _selection(std::move(selection)),
          _passesAll(_selection.codes.empty() && !_selection.range.from && !_selection.range.to) {}

    /// From now on only messages of the technology of that index are selected.
    void setTechnology(std::uint32_t technology) {
        _technology = technology;
        _passesAll = false;
    }

    /// Whether the message is to be decoded. Call it once for each message of the file, in order.
    [[nodiscard]] bool passes(const LoggedMessage& message) {
        if (!_first)
            _first = message.time;
        if (_passesAll)
            return true;
        return (!_technology || message.technology == *_technology) &&
               decodedRange().contains(message.time, *_first) &&
               (_selection.codes.empty() || hasCode(message));
    }

    /// The time of the file's first message; absent before it.
    [[nodiscard]] const std::optional<Time>& first() const { return _first; }
    /// Whether what happens at that time is to be written. Precondition: there has been a message.
    [[nodiscard]] bool writes(Time moment) const {
        return !_selection.isWarm || TimeRange{_selection.range.from, std::nullopt}.contains(moment, *_first);
    }

private:
    [[nodiscard]] TimeRange decodedRange() const {
        return _selection.isWarm ? TimeRange{std::nullopt, _selection.range.to} : _selection.range;
    }
    [[nodiscard]] bool hasCode(const LoggedMessage& message) const;

    MessageSelection _selection;
    std::optional<Time> _first; ///< the time of the file's first message
    std::optional<std::uint32_t> _technology;
    bool _passesAll; ///< which is most often so, and asked for millions of times
};

} // namespace velmora
