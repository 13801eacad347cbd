// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Truth/StatedCell.h"
#include "Telephony/Drives/Truth/TruthSink.h"

#include <optional>
#include <vector>

namespace velmora {

/// A cell and the level that a message has reported of it.
struct TruthLevel {
    TruthCell cell;
    double level_dBm = 0;
};

/// Reselections that came late, after a cell had been stronger for long, and early ones, to a cell that was
/// not stronger, by the limits of Documentation/events.md. It goes by the levels that messages have
/// reported, as of the moments of the reports; the identity of a neighbour may be left out.
class StatedReselections {
public:
    explicit StatedReselections(TruthSink& sink) : _sink(sink) {}

    /// A message of this moment states a change of the cell; to be called before its levels.
    void move(TruthTime at, const TruthMove& move);
    /// A message of this moment reports the serving cell's level.
    void measureServing(TruthTime at, double level_dBm);
    /// A message of this moment reports the neighbours that the serving cell can be compared with.
    void measureNeighbours(TruthTime at, std::vector<TruthLevel> neighbours);
    /// To be called after each message, and after what it measures.
    void confirm(TruthTime at);
    /// The phone is on no cell any more.
    void forget();

private:
    struct Better {
        TruthCell cell;
        TruthTime since;
    };
    /// A reselection that is early if the cell that the phone left is not weaker afterwards.
    struct Early {
        TruthTime at;
        TruthCell from;
    };

    [[nodiscard]] bool areFresh(TruthTime at) const;
    void compare(TruthTime at);
    void judgeEarly(TruthTime at);
    void tell(TruthTime at, std::string_view kind) const;

    TruthSink& _sink;
    std::optional<TruthTime> _servingAt;
    double _serving_dBm = 0;
    std::optional<TruthTime> _neighboursAt;
    std::vector<TruthLevel> _neighbours;
    std::vector<TruthLevel> _compared; ///< with the serving cell's level, and by how much they were stronger
    TruthTime _comparedAt{0};          ///< when the compared neighbours were reported
    std::vector<Better> _better;       ///< those that have been stronger by the margin of a late reselection
    std::optional<Early> _early;
    bool _isMeasured = false; ///< by the message of this moment
};

} // namespace velmora
