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

/// Plays a list of messages to a sink in time: each when its offset has come, `speed` times as fast as the
/// offsets say. In one wake-up it sends a bounded number, so that playing starves nothing; where that is not
/// enough to keep up, it plays as fast as it can, and what it is behind by more than a quarter of a second it
/// does not catch up. A clock that is set meanwhile neither stops nor rushes it. Main thread only.
class MessagePlayer {
public:
    /// Gives the next message; none at the end.
    using Next = std::function<std::optional<ScenarioEvent>()>;

    /// As fast as the sink has room, whatever the offsets say.
    static constexpr double unpaced = 0;
    /// The most messages of one wake-up.
    static constexpr int batch = 500;
    /// The shortest sleep between two wake-ups. Others have their turn in it.
    static constexpr std::chrono::milliseconds shortestSleep{1};

    /// Queue and clock must outlive the player. Precondition: speed >= 0.
    MessagePlayer(MainQueue& queue, const Clock& clock, double speed);
    ~MessagePlayer();
    MessagePlayer(const MessagePlayer&) = delete;
    MessagePlayer& operator=(const MessagePlayer&) = delete;

    /// Plays from now on, never from inside this call. Precondition: not started.
    void start(LogSink& sink, Next next);
    /// Plays no more; allowed at any time, also from inside the sink.
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
