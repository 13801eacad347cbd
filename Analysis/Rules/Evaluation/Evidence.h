// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"

#include <algorithm>
#include <cstddef>
#include <vector>

namespace velmora {

/// The messages that make an event: the first ones, and the latest.
class Evidence {
public:
    void add(const MessageNumber& message) {
        if (!_messages.empty() && message <= _messages.back())
            return;
        if (_messages.size() == Event::mostEvidence)
            _messages.erase(_messages.begin() + Event::mostEvidence / 2);
        _messages.push_back(message);
    }
    /// In any order, before any others.
    void addFirst(std::vector<MessageNumber> messages) {
        std::sort(messages.begin(), messages.end());
        for (const MessageNumber& each : messages)
            add(each);
    }
    void clear() { _messages.clear(); }
    [[nodiscard]] const std::vector<MessageNumber>& messages() const { return _messages; }

private:
    std::vector<MessageNumber> _messages;
};

} // namespace velmora
