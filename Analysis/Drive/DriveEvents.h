// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/EventSink.h"

#include <cstddef>
#include <cstdint>
#include <deque>

namespace velmora {

/// The latest events, the newest first and those of a time by kind: the reverse of the order in which
/// velmora-log lists them. One that lasts is there from its begin on; when it ends, the complete one takes
/// its place. What is kept of an event is what lists show, without fields and evidence.
class DriveEvents final : public EventSink {
public:
    static constexpr std::size_t most = 1000;

    /// Of more than that many, the oldest are forgotten.
    explicit DriveEvents(std::size_t limit = most) : _limit(limit) {}

    void began(const Event& event) override { add(event); }
    void happened(const Event& event) override;
    void forgetAll();

    [[nodiscard]] const std::deque<Event>& events() const { return _events; }
    /// Changes with the list.
    [[nodiscard]] std::uint64_t revision() const { return _revision; }

private:
    void add(const Event& event);

    std::size_t _limit;
    std::deque<Event> _events;
    std::uint64_t _revision = 0;
};

} // namespace velmora
