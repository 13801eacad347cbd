// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/LoopTimer.h"

#include <QTimer>

#include <algorithm>
#include <limits>

namespace velmora {

class LoopTimer::Impl : public QTimer {
public:
    explicit Impl(std::function<void()> action) : _action(std::move(action)) {
        setTimerType(Qt::PreciseTimer);
        // An uncaught exception ends the program here, not somewhere inside the event loop.
        callOnTimeout(this, [this]() noexcept { run(); });
    }

    void release() {
        stop();
        if (_depth > 0)
            deleteLater();
        else
            delete this;
    }

private:
    void run() {
        ++_depth;
        _action();
        --_depth;
    }

    std::function<void()> _action;
    int _depth = 0; ///< actions that are running; the object outlives them
};

LoopTimer::LoopTimer(std::function<void()> action) : _impl(new Impl(std::move(action))) {}

LoopTimer::~LoopTimer() {
    _impl->release();
}

void LoopTimer::startOnce(std::chrono::nanoseconds delay) {
    _impl->setSingleShot(true);
    _impl->start(loopMilliseconds(delay));
}

void LoopTimer::startRepeating(std::chrono::nanoseconds interval) {
    _impl->setSingleShot(false);
    _impl->start(std::max(loopMilliseconds(interval), std::chrono::milliseconds(1)));
}

void LoopTimer::stop() {
    _impl->stop();
}

bool LoopTimer::isRunning() const {
    return _impl->isActive();
}

std::chrono::milliseconds loopMilliseconds(std::chrono::nanoseconds time) {
    constexpr std::chrono::milliseconds longest(std::numeric_limits<int>::max());
    if (time <= std::chrono::nanoseconds::zero())
        return std::chrono::milliseconds::zero();
    if (time >= longest)
        return longest;
    return std::chrono::ceil<std::chrono::milliseconds>(time);
}

} // namespace velmora
