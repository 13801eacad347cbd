// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"

namespace velmora {

/// Gets events as they become known.
class EventSink {
public:
    virtual ~EventSink() = default;

    /// An event that lasts has begun; `happened` follows with the same time and kind. For what is
    /// shown live; the default takes no notice.
    virtual void began(const Event& /*event*/) {}
    /// An event is complete: it happened at a moment, or what lasted has ended. In the order in which this
    /// becomes known, which is not always that of the events' times.
    virtual void happened(const Event& event) = 0;
};

} // namespace velmora
