// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>
#include <string>
#include <tuple>
#include <utility>

namespace velmora {

/// Sorts events by their begin, and those of the same time by kind. It holds a bounded number: once there are
/// more, the earliest is passed on, so that one that becomes known later than so many others may come out
/// of order.
class EventOrder {
public:
    static constexpr std::size_t mostHeld = 4096;

    explicit EventOrder(std::function<void(const Event&)> pass) : _pass(std::move(pass)) {}

    void add(const Event& event) {
        _held.emplace(Key{event.time, event.kind, _added++}, event);
        if (_held.size() > mostHeld)
            passFirst();
    }
    /// Passes on all.
    void flush() {
        while (!_held.empty())
            passFirst();
    }

private:
    /// The last one keeps the order in which events became known.
    using Key = std::tuple<Time, std::string, std::uint64_t>;

    void passFirst() {
        _pass(_held.begin()->second);
        _held.erase(_held.begin());
    }

    std::function<void(const Event&)> _pass;
    std::map<Key, Event> _held;
    std::uint64_t _added = 0;
};

} // namespace velmora
