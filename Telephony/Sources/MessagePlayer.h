// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/MainQueue.h"
#include "Telephony/Drives/Scenario.h"
#include "Telephony/Sources/LogSource.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>

namespace velmora {

/// Plays a list of messages to a sink, each at its offset divided by `speed`. It sends a bounded number per
/// wake-up, so that playing starves nothing; where that is too slow it plays as fast as it can, and does not
/// catch up a delay of more than a quarter of a second. Setting the clock neither stops nor accelerates it.
/// Main thread only.
class MessagePlayer {
public:
    /// Returns the next message; none at the end.
    using Next = std::function<std::optional<ScenarioEvent>()>;

    /// As fast as the sink has room, ignoring the offsets.
    static constexpr double unpaced = 0;
    /// The most messages of one wake-up.
    static constexpr int batch = 500;
    /// The shortest sleep between two wake-ups, in which other work runs.
    static constexpr std::chrono::milliseconds shortestSleep{1};

    /// Queue and clock must outlive the player. Precondition: speed >= 0.
    MessagePlayer(MainQueue& queue, const Clock& clock, double speed);
    ~MessagePlayer();
    MessagePlayer(const MessagePlayer&) = delete;
    MessagePlayer& operator=(const MessagePlayer&) = delete;

    /// Plays from now on, never from inside this call. Precondition: not started.
    void start(LogSink& sink, Next next);
    /// Stops playing; allowed at any time, also from inside the sink.
    void stop();

private:
    struct Run;

    static void wake(const std::shared_ptr<Run>& run);
    static void sleep(const std::shared_ptr<Run>& run, std::chrono::nanoseconds duration);

    MainQueue& _queue;
    const Clock& _clock;
    double _speed;
    std::shared_ptr<Run> _run; ///< null when not started
};

} // namespace velmora
