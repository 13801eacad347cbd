// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Truth/TruthSink.h"

#include <cstdint>
#include <optional>
#include <string_view>

namespace velmora {

/// A cell of any radio technology.
struct TruthCell {
    std::string_view radio; ///< the technology's name, a constant
    std::int64_t channel = 0;
    std::int64_t physical = 0; ///< BSIC, scrambling code, physical identity, PN offset
    std::int64_t identity = 0;
    friend bool operator==(const TruthCell&, const TruthCell&) = default;
};

/// Who decides on a change of the cell: the phone or the network. Unknown where no message of the technology
/// shows it.
enum class TruthMode : std::uint8_t { Idle, Connected, Unknown };

/// What a phone is on, and what messages show of it.
struct TruthServing {
    std::optional<TruthCell> cell; ///< absent where it is on none
    bool isStated = false; ///< whether a message of this moment states the cell, or that there is none
    TruthMode mode = TruthMode::Idle;
    TruthMode shown = TruthMode::Idle; ///< the mode that the latest message about it showed
};

/// A change of the cell that a message has stated.
struct TruthMove {
    TruthCell from, to;
    TruthMode mode = TruthMode::Idle;
};

/// The phone's serving cell and what messages have stated of it: reselections, handovers, changes of the
/// radio technology, and the return to a cell that it has just left. The first cell after a search is none of
/// them.
class StatedCell {
public:
    explicit StatedCell(TruthSink& sink) : _sink(sink) {}

    /// Returns the change that the message of this moment states, if it is one that messages show.
    std::optional<TruthMove> update(TruthTime at, const TruthServing& serving);
    /// A message of this moment states a cell although the phone is on none; the changes to it and from it
    /// are hidden.
    void misstate(TruthTime at, const TruthCell& cell);

private:
    struct Left {
        TruthCell cell;
        TruthTime at;
    };

    void change(const TruthServing& serving);
    /// The new cell is stated.
    std::optional<TruthMove> state(TruthTime at, TruthMode shown);
    void tell(TruthTime at, std::string_view kind, const TruthCell& to, bool isHidden);
    void returnTo(TruthTime at);

    TruthSink& _sink;
    std::optional<TruthCell> _now;
    TruthMode _mode = TruthMode::Idle; ///< in which it came to `_now`
    bool _isPending = false;           ///< whether `_now` has not been stated yet
    bool _wasAbsent = true;            ///< whether there was a time without a cell before `_now`
    bool _isAbsenceStated = false;
    std::optional<TruthCell> _stated;
    std::optional<Left> _left;
};

} // namespace velmora
