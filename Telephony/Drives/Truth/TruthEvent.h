// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// When something is, counted from the scenario's start.
using TruthTime = std::chrono::nanoseconds;

/// Something that a drive's phone did, as the scenario itself knows it. The kinds are those of events.
struct TruthEvent {
    TruthTime at{0}; ///< of the message that could first state it; of a hidden one, of the phone's change
    std::optional<TruthTime> end; ///< of one that lasts, of the message that could first state its end
    std::string_view kind;
    /// No message could state it, so that none is expected to find it.
    bool isHidden = false;
    /// "from", "to", "machine" and others; the names are constants.
    std::vector<std::pair<std::string_view, std::string>> fields;
};

} // namespace velmora
