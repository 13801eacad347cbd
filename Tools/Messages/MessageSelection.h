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
    /// Only records of these log codes, as LogMessage::logCode returns them; empty for all messages.
    std::vector<std::uint32_t> codes;
};

/// Applies a selection to the messages of a file, which it gets from the first one on.
class MessageFilter {
public:
    explicit MessageFilter(MessageSelection selection) : _selection(std::move(selection)) {}

    /// Whether the message is selected. Call it once for each message of the file, in order.
    [[nodiscard]] bool passes(const LoggedMessage& message) {
        if (!_first)
            _first = message.time;
        return _selection.range.contains(message.time, *_first) &&
               (_selection.codes.empty() || hasCode(message));
    }

private:
    [[nodiscard]] bool hasCode(const LoggedMessage& message) const;

    MessageSelection _selection;
    std::optional<Time> _first; ///< the time of the file's first message
};

} // namespace velmora
