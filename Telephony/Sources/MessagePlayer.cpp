// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Sources/MessagePlayer.h"

#include <algorithm>
#include <cassert>
#include <utility>

namespace velmora {
namespace {

using std::chrono::nanoseconds;

/// What sending and sleeping may take beyond the sleep that was asked for. More is the machine's own sleep,
/// or a clock that was set: the messages wait for it.
constexpr nanoseconds longestOversleep = std::chrono::seconds(1);
/// The largest delay, in nanoseconds of the clock, that it catches up.
constexpr double longestLag = 250e6;
constexpr nanoseconds longestSleep = std::chrono::hours(1);
/// How often a sink without room is asked again.
constexpr nanoseconds roomSleep = std::chrono::milliseconds(2);

} // namespace

/// One start up to its stop. Tasks on the queue hold it weakly, so that stopping ends them.
struct MessagePlayer::Run {
    MainQueue& queue;
    const Clock& clock;
    double speed;
    LogSink& sink;
    Next next;
    bool stopped = false;
    std::optional<ScenarioEvent> event; ///< the one that waits
    double position_ns = 0;             ///< how far offsets have come
    Time lastWake;                      ///< when that was reckoned; the sending itself takes time too
    nanoseconds asleep{0};              ///< how long the sleep since then was to be
};

MessagePlayer::MessagePlayer(MainQueue& queue, const Clock& clock, double speed)
    : _queue(queue), _clock(clock), _speed(speed) {}

MessagePlayer::~MessagePlayer() {
    stop();
}

void MessagePlayer::start(LogSink& sink, Next next) {
    assert(!_run);
    _run = std::make_shared<Run>(
        Run{_queue, _clock, _speed, sink, std::move(next), false, {}, 0, _clock.now(), {}});
    sleep(_run, nanoseconds::zero());
}

void MessagePlayer::stop() {
    if (const auto run = std::exchange(_run, nullptr))
        run->stopped = true;
}

void MessagePlayer::sleep(const std::shared_ptr<Run>& run, nanoseconds duration) {
    run->asleep = duration;
    run->queue.after(duration, [weak = std::weak_ptr<Run>(run)] {
        if (const auto awake = weak.lock())
            wake(awake);
    });
}

void MessagePlayer::wake(const std::shared_ptr<Run>& run) {
    const bool paced = run->speed != unpaced;
    const Time now = run->clock.now();
    const nanoseconds passed = std::clamp(now - run->lastWake, run->asleep, run->asleep + longestOversleep);
    run->lastWake = now;
    run->position_ns += static_cast<double>(passed.count()) * run->speed;
    if (!paced && !run->sink.hasRoom())
        return sleep(run, roomSleep);

    for (int sent = 0; sent < batch; ++sent) {
        if (!run->event)
            run->event = run->next();
        if (!run->event) {
            run->sink.sourceEnded();
            return;
        }
        const double ahead_ns = static_cast<double>(run->event->offset.count()) - run->position_ns;
        if (paced && ahead_ns > 0) {
            const double wait_ns = std::min(ahead_ns / run->speed, static_cast<double>(longestSleep.count()));
            return sleep(run, std::max(nanoseconds(static_cast<std::int64_t>(wait_ns) + 1),
                                       nanoseconds(shortestSleep)));
        }
        const Data message = std::move(run->event->message);
        // Sending may stop the run.
        const auto offset_ns = static_cast<double>(run->event->offset.count());
        run->event.reset();
        run->sink.receive(message);
        if (run->stopped)
            return;
        if (sent == batch - 1)
            run->position_ns = std::min(run->position_ns, offset_ns + longestLag * run->speed);
    }
    sleep(run, shortestSleep);
}

} // namespace velmora
