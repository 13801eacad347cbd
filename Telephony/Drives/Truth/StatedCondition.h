// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Truth/TruthSink.h"

#include <optional>
#include <string_view>

namespace velmora {

/// Something that is so for a while, such as limited service, and what messages have stated of it. It lasts
/// from the message that states it to the one that states its end; what ends before a message states it is
/// hidden.
class StatedCondition {
public:
    /// `kind` must be a constant; the sink must outlive this.
    StatedCondition(TruthSink& sink, std::string_view kind) : _sink(sink), _kind(kind) {}

    /// It is so now or not, which a message of this moment states or does not.
    void update(TruthTime at, bool isSo, bool isStated);
    /// The drive is over.
    void finish();

private:
    TruthSink& _sink;
    std::string_view _kind;
    std::optional<TruthTime> _unstatedSince;
    std::optional<TruthTime> _since; ///< as stated
};

} // namespace velmora
