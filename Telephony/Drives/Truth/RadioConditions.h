// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Truth/HeldCondition.h"

#include <string_view>
#include <vector>

namespace velmora {

/// Weak coverage, poor quality and pilot pollution of the serving cell, by the limits of
/// Documentation/events.md.
class RadioConditions {
public:
    explicit RadioConditions(TruthSink& sink)
        : _weak(sink, "weak-coverage", held, held), _poor(sink, "poor-quality", held, held),
          _pollution(sink, "pilot-pollution", held, held) {}

    /// A message of this moment reports the level of a cell of that technology: RXLEV, RSCP or RSRP.
    void measureLevel(TruthTime at, std::string_view radio, double level_dBm);
    /// The same of the quality: Ec/No, RSRQ or the strength of the best pilot.
    void measureQuality(TruthTime at, std::string_view radio, double quality_dB);
    /// The technology has no quality, or none that is poor.
    void measureNoQuality(TruthTime at) { _poor.measure(at, false, true); }
    /// The same by another measure.
    void judgeQuality(TruthTime at, bool isPoor, bool isGood) { _poor.measure(at, isPoor, isGood); }
    /// The same of the neighbours on the serving cell's channel.
    void measureNeighbours(TruthTime at, double serving_dBm, const std::vector<double>& neighbours_dBm);
    /// Neighbours have channels of their own.
    void measureNoNeighbours(TruthTime at) { _pollution.measure(at, false, true); }
    /// The phone is on no cell any more.
    void lose(TruthTime at);
    void loseQuality(TruthTime at) { _poor.lose(at); }
    /// To be called after each message, and after what it measures.
    void confirm(TruthTime at);
    void finish();

private:
    static constexpr TruthTime held = std::chrono::seconds(5);

    HeldCondition _weak, _poor, _pollution;
};

} // namespace velmora
