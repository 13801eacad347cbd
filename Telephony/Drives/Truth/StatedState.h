// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Truth/TruthSink.h"

#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// A state machine of the phone and what messages have stated of it. It changes, for those who read the
/// messages, when one states another state than the latest one; a state that ends before is hidden.
class StatedState {
public:
    /// `kind` and `machine` must be constants; the sink must outlive this.
    StatedState(TruthSink& sink, std::string_view kind, std::string_view machine)
        : _sink(sink), _kind(kind), _machine(machine) {}

    /// The phone is in that state now, which a message of this moment states or does not.
    void update(TruthTime at, std::string_view state, bool isStated);

    /// A message of this moment states a state that the phone is not in; the change to it and back is hidden.
    void misstate(TruthTime at, std::string_view state);

private:
    void tell(TruthTime at, std::string_view to, bool isHidden);

    TruthSink& _sink;
    std::string_view _kind;
    std::string_view _machine;
    std::string _now;
    TruthTime _since{0};
    std::optional<std::string> _stated;
    bool _isPending = false;   ///< whether `_now` has not been stated yet
    bool _isMisstated = false; ///< whether `_stated` is what the phone has not been in
};

} // namespace velmora
