// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Support/FakeMainQueue.h"

#include <algorithm>
#include <stdexcept>
#include <utility>

namespace velmora {

class FakeMainQueue::FakeTimer final : public Timer {
public:
    explicit FakeTimer(std::shared_ptr<TimerState> state) : _state(std::move(state)) {}
    ~FakeTimer() override { FakeTimer::invalidate(); }
    FakeTimer(const FakeTimer&) = delete;
    FakeTimer& operator=(const FakeTimer&) = delete;

    void invalidate() override {
        _state->running = false;
        // An action that stops its own timer goes on to its end; `tick` drops it afterwards.
        if (!_state->ticking)
            _state->action = nullptr;
    }

private:
    std::shared_ptr<TimerState> _state;
};

void FakeMainQueue::async(Task task) {
    _pending.push_back(std::move(task));
}

void FakeMainQueue::after(std::chrono::nanoseconds delay, Task task) {
    _delayed.push_back({_elapsed + delay, _sequence++, std::move(task)});
}

std::unique_ptr<Timer> FakeMainQueue::repeating(std::chrono::nanoseconds interval, Task action) {
    if (interval <= std::chrono::nanoseconds::zero())
        throw std::invalid_argument("a repeating timer needs an interval above zero");
    auto state = std::make_shared<TimerState>(
        TimerState{_elapsed + interval, _sequence++, interval, std::move(action)});
    _timers.push_back(state);
    return std::make_unique<FakeTimer>(std::move(state));
}

void FakeMainQueue::runPending() {
    constexpr int mostTasks = 1'000'000;
    for (int count = 0; !_pending.empty(); ++count) {
        if (count == mostTasks)
            throw std::runtime_error("the tasks of the main queue go on queuing others without end");
        const Task task = std::move(_pending.front());
        _pending.pop_front();
        task();
    }
}

void FakeMainQueue::advance(std::chrono::nanoseconds duration) {
    const auto end = _elapsed + duration;
    runPending();
    while (runNext(end))
        runPending();
    moveTo(end);
}

std::size_t FakeMainQueue::timerCount() const {
    return static_cast<std::size_t>(
        std::count_if(_timers.begin(), _timers.end(), [](const auto& timer) { return timer->running; }));
}

bool FakeMainQueue::runNext(std::chrono::nanoseconds until) {
    std::erase_if(_timers, [](const auto& timer) { return !timer->running; });

    const auto earlier = [](const auto& a, const auto& b) {
        return std::pair(a.due, a.sequence) < std::pair(b.due, b.sequence);
    };
    const auto delayed = std::min_element(_delayed.begin(), _delayed.end(), earlier);
    std::shared_ptr<TimerState> timer;
    for (const auto& candidate : _timers)
        if (!candidate->ticking && (!timer || earlier(*candidate, *timer)))
            timer = candidate;

    const bool haveDelayed = delayed != _delayed.end() && delayed->due <= until;
    const bool haveTimer = timer && timer->due <= until;
    if (haveDelayed &&
        (!haveTimer || std::pair(delayed->due, delayed->sequence) < std::pair(timer->due, timer->sequence))) {
        const Delayed next = std::move(*delayed);
        _delayed.erase(delayed);
        moveTo(next.due);
        next.task();
        return true;
    }
    if (haveTimer) {
        moveTo(timer->due);
        tick(timer);
        return true;
    }
    return false;
}

void FakeMainQueue::tick(const std::shared_ptr<TimerState>& timer) {
    timer->due += timer->interval;
    timer->sequence = _sequence++;
    timer->ticking = true;
    timer->action();
    timer->ticking = false;
    if (!timer->running)
        timer->action = nullptr;
    while (timer->due <= _elapsed)
        timer->due += timer->interval;
}

void FakeMainQueue::moveTo(std::chrono::nanoseconds moment) {
    if (moment <= _elapsed)
        return;
    _clock.advance(moment - _elapsed);
    _elapsed = moment;
}

} // namespace velmora
