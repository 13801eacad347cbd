// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"

#include <algorithm>

namespace velmora {

/// From which message to which a figure is made of messages; not of all between them.
struct MessageRange {
    bool isKnown = false;
    MessageNumber first;
    MessageNumber last;

    void add(MessageNumber message) {
        if (!isKnown)
            first = message;
        last = message; // they come in their order
        isKnown = true;
    }
    void add(const MessageRange& other) {
        if (!other.isKnown)
            return;
        first = isKnown ? std::min(first, other.first) : other.first;
        last = isKnown ? std::max(last, other.last) : other.last;
        isKnown = true;
    }
};

} // namespace velmora
