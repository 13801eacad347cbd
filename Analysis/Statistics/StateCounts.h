// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <map>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// What a state's leaf reported: an enumeration's raw number, a flag, or a text.
struct StateKey {
    ObservedKind kind = ObservedKind::Absent;
    std::int64_t raw = 0;
    std::string words{}; ///< of a text

    [[nodiscard]] bool is(const Observation& observation) const {
        return kind == observation.kind &&
               (kind == ObservedKind::Text ? words == observation.words : raw == observation.raw);
    }
    friend auto operator<=>(const StateKey&, const StateKey&) = default;
};

/// The values of a state: how often each was reported, how long each held, and which followed which. The
/// first `most` values are kept one by one, all others together, under the index `others`.
class StateCounts {
public:
    static constexpr std::size_t most = 64;
    static constexpr std::size_t others = most;

    struct Value {
        StateKey key{};
        std::string text{}; ///< as the display shows it; empty for the others
        std::uint64_t samples = 0;
        std::chrono::nanoseconds time{0};
    };
    /// How often one value followed another, by their indexes.
    using Transitions = std::map<std::pair<std::size_t, std::size_t>, std::uint64_t>;

    /// The index of the observation's value, which is added where it is new.
    [[nodiscard]] std::size_t indexOf(const Observation& observation, ObservedText& texts);
    /// The same of a value that another object has.
    [[nodiscard]] std::size_t indexOf(const Value& value);

    void addSample(std::size_t value) { ++at(value).samples; }
    void addTime(std::size_t value, std::chrono::nanoseconds time) { at(value).time += time; }
    void addTransition(std::size_t from, std::size_t to) { ++_transitions[{from, to}]; }
    void add(const StateCounts& other);

    /// In the order of their first reports, without the others.
    [[nodiscard]] const std::vector<Value>& values() const { return _values; }
    /// The value of an index.
    [[nodiscard]] const Value& at(std::size_t value) const {
        return value == others ? _others : _values[value];
    }
    [[nodiscard]] bool hasOthers() const { return _others.samples != 0 || _others.time.count() != 0; }
    [[nodiscard]] const Transitions& transitions() const { return _transitions; }

    [[nodiscard]] std::uint64_t samples() const;
    [[nodiscard]] std::uint64_t transitionCount() const;
    /// How long the state was known.
    [[nodiscard]] std::chrono::nanoseconds time() const;

private:
    [[nodiscard]] Value& at(std::size_t value) { return value == others ? _others : _values[value]; }
    [[nodiscard]] std::size_t add(StateKey key, std::string_view text);

    std::vector<Value> _values;
    Value _others;
    Transitions _transitions;
    std::size_t _latest = 0; ///< the index of the latest observation's value, if that is kept
};

} // namespace velmora
