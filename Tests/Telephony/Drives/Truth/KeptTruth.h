// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Truth/TruthSink.h"

#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Keeps what a drive's phone did.
class KeptTruth final : public TruthSink {
public:
    void happened(const TruthEvent& event) override { events.push_back(event); }

    /// Those of that kind that messages state, in the order of their times.
    [[nodiscard]] std::vector<TruthEvent> of(std::string_view kind) const;

    std::vector<TruthEvent> events;
};

/// Empty where there is none of that name.
[[nodiscard]] std::string fieldOf(const TruthEvent& event, std::string_view name);
[[nodiscard]] double secondsOf(TruthTime time);

/// The truth of that scenario's first seconds.
[[nodiscard]] KeptTruth truthOf(std::string_view scenario, std::uint64_t seed, double duration_s);

} // namespace velmora
