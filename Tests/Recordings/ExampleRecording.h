// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/Result.h"
#include "Telephony/Drives/ScenarioRegistry.h"

#include <cstdint>
#include <functional>
#include <span>
#include <string>
#include <string_view>

namespace velmora {

/// A recording of this folder: excerpts of a scenario's drive, which is too long to be kept completely. Each
/// message's arrival time is its record's time stamp plus a fixed delay, so that the file depends on the
/// table in the source alone and is the same at every run. Main thread only.
struct ExampleRecording {
    /// Seconds of the drive, the end left out; in order, and apart from one another.
    struct Excerpt {
        double from_s;
        double to_s;
    };

    std::string_view scenario; ///< its name, and the recording's
    std::uint64_t seed;
    std::span<const Excerpt> excerpts;

    /// "gsm.pcapng"
    [[nodiscard]] std::string fileName() const { return std::string(scenario) + ".pcapng"; }
    /// A new scenario at its beginning.
    [[nodiscard]] std::unique_ptr<Scenario> makeScenario() const;
    /// Calls `take` for every message, with the moment of its arrival.
    void eachMessage(const std::function<void(Time, const Data&)>& take) const;
    /// Writes the recording, over one that is there.
    [[nodiscard]] Result<Done> write(const std::string& path) const;
};

/// One a scenario, in the registry's order.
[[nodiscard]] std::span<const ExampleRecording> exampleRecordings();

} // namespace velmora
