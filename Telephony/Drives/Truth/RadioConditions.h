// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Truth/HeldCondition.h"

#include <optional>
#include <string_view>
#include <vector>

namespace velmora {

/// Weak coverage, poor quality and pilot pollution of the serving cell, by the limits of
/// Documentation/events.md.
class RadioConditions {
public:
    /// `fresh`: a level of the serving cell that is older is not compared with neighbours.
    explicit RadioConditions(TruthSink& sink, TruthTime fresh = std::chrono::seconds(2))
        : _weak(sink, "weak-coverage", held, held), _poor(sink, "poor-quality", held, held),
          _pollution(sink, "pilot-pollution", held, held), _fresh(fresh) {}

    /// A message of this moment reports the level of a cell of that technology: RXLEV, RSCP or RSRP.
    void measureLevel(TruthTime at, std::string_view radio, double level_dBm);
    /// The same of the quality: Ec/No, RSRQ or the strength of the best pilot.
    void measureQuality(TruthTime at, std::string_view radio, double quality_dB);
    /// The technology has no quality, or none that is poor.
    void measureNoQuality(TruthTime at) { _poor.measure(at, false, true); }
    /// The same by another measure.
    void judgeQuality(TruthTime at, bool isPoor, bool isGood) { _poor.measure(at, isPoor, isGood); }
    /// A message of this moment reports the serving cell's level, with which those of neighbours are
    /// compared. Messages report the two at different moments: what is compared is what each has had then.
    void compareServing(TruthTime at, double level_dBm);
    /// A message of this moment reports neighbours: those on the serving cell's channel, and whether there
    /// are any on whichever channel.
    void compareNeighbours(TruthTime at, std::vector<double> levels_dBm, bool hasAny);
    /// Neighbours have channels of their own.
    void compareNoNeighbours();
    /// A message of this moment states another cell: nothing is known of it until messages report it.
    void changeCell(TruthTime at);
    /// The phone is on no cell any more. What was compared counts until it is too old.
    void lose(TruthTime at);
    void loseQuality(TruthTime at) { _poor.lose(at); }
    /// To be called after each message, and after what it measures.
    void confirm(TruthTime at);
    void finish();

private:
    static constexpr TruthTime held = std::chrono::seconds(5);

    struct Serving {
        TruthTime at;
        double level_dBm;
    };
    struct Neighbours {
        TruthTime at;
        std::vector<double> levels_dBm;
    };

    void compare(TruthTime at);
    void forgetLevels();

    HeldCondition _weak, _poor, _pollution;
    std::optional<Serving> _serving;       ///< as last reported
    std::optional<Neighbours> _neighbours; ///< the same; none where the last report had none
    TruthTime _fresh;
    bool _isAlone = false; ///< neighbours have channels of their own
};

} // namespace velmora
