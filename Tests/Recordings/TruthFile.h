// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/Result.h"
#include "Telephony/Drives/Truth/TruthSink.h"

#include <string>
#include <vector>

namespace velmora {

/// Keeps what a drive's phone did and writes it as JSON lines: an object an event, with "time", "end" where
/// it lasts and has ended, "kind", "hidden" where no message states it, and its fields.
class TruthFile final : public TruthSink {
public:
    void happened(const TruthEvent& event) override { _events.push_back(event); }

    /// Writes what was so until `last`, the time of the drive's last message, in the order of time; the drive
    /// began at `start`.
    [[nodiscard]] Result<Done> write(const std::string& path, Time start, TruthTime last);

private:
    std::vector<TruthEvent> _events;
};

} // namespace velmora
