// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"
#include "Platform/Clock.h"
#include "Tools/Messages/TimeRange.h"

#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Which events a command lists.
struct EventSelection {
    std::vector<std::string> kinds; ///< empty for all
    Severity least = Severity::Info;
    TimeRange range;

    /// Whether the event lies in the range or reaches into it, and is of these kinds and at least that
    /// severity. One that lasts and has no end reaches to the end of all time. `first`: the time of the
    /// first message.
    [[nodiscard]] bool contains(const Event& event, Time first) const;
    /// The same of its begin alone.
    [[nodiscard]] bool containsBegin(const Event& event, Time first) const;

private:
    [[nodiscard]] bool matches(const Event& event) const;
};

} // namespace velmora
