// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"
#include "Analysis/Tracks/Geodesy.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>
#include <optional>
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

    /// Gets each event with where it happened or began, if that is known.
    using Pass = std::function<void(const Event& event, const std::optional<Coordinates>& place)>;

    explicit EventOrder(Pass pass) : _pass(std::move(pass)) {}

    void add(const Event& event, const std::optional<Coordinates>& place = {}) {
        _held.emplace(Key{event.time, event.kind, _added++}, Held{event, place});
        if (_held.size() > mostHeld)
            passFirst();
    }
    /// Passes on all.
    void flush() {
        while (!_held.empty())
            passFirst();
    }

private:
    struct Held {
        Event event;
        std::optional<Coordinates> place;
    };
    /// The last one keeps the order in which events became known.
    using Key = std::tuple<Time, std::string, std::uint64_t>;

    void passFirst() {
        const Held& first = _held.begin()->second;
        _pass(first.event, first.place);
        _held.erase(_held.begin());
    }

    Pass _pass;
    std::map<Key, Held> _held;
    std::uint64_t _added = 0;
};

} // namespace velmora
