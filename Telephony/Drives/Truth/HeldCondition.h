// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Truth/TruthSink.h"

#include <optional>
#include <string_view>

namespace velmora {

/// A condition of what the phone measures, such as a low level, that counts when it has held for a while. It
/// lasts until what ends it has held for a while; both times are those since when it has. A message has to
/// confirm that it still holds then. What the phone has not measured for ten seconds is not known any more:
/// then what lasts has no end.
class HeldCondition {
public:
    /// `kind` must be a constant; the sink must outlive this.
    HeldCondition(TruthSink& sink, std::string_view kind, TruthTime holdFor, TruthTime keep)
        : _sink(sink), _kind(kind), _holdFor(holdFor), _keep(keep) {}

    /// A message of this moment reports a measurement: by which it is so, or ends, or neither. `confirm` is
    /// to follow.
    void measure(TruthTime at, bool isSo, bool isEnd);
    /// Nothing is measured from this moment on.
    void lose(TruthTime at);
    /// A message of this moment confirms what has been measured.
    void confirm(TruthTime at);
    /// The drive is over.
    void finish();

private:
    void confirmLoss(TruthTime at);
    void tell(std::optional<TruthTime> end);

    TruthSink& _sink;
    std::string_view _kind;
    TruthTime _holdFor, _keep;
    std::optional<TruthTime> _since;      ///< it has been so
    std::optional<TruthTime> _ending;     ///< what ends it has held
    std::optional<TruthTime> _unmeasured; ///< nothing has been measured
    bool _isLasting = false;
};

} // namespace velmora
