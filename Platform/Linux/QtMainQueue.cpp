// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/QtMainQueue.h"

#include "Platform/Linux/LoopTimer.h"

#include <QObject>
#include <QTimer>

#include <utility>

namespace velmora {

namespace {

class QtTimer final : public Timer {
public:
    QtTimer(std::chrono::nanoseconds interval, MainQueue::Task action) : _timer(std::move(action)) {
        _timer.startRepeating(interval);
    }
    void invalidate() override { _timer.stop(); }

private:
    LoopTimer _timer;
};

} // namespace

class QtMainQueue::Context : public QObject {};

QtMainQueue::QtMainQueue() : _context(std::make_unique<Context>()) {}

QtMainQueue::~QtMainQueue() = default;

void QtMainQueue::async(Task task) {
    QMetaObject::invokeMethod(
        _context.get(), [task = std::move(task)]() noexcept { task(); }, Qt::QueuedConnection);
}

void QtMainQueue::after(std::chrono::nanoseconds delay, Task task) {
    QTimer::singleShot(loopMilliseconds(delay), Qt::PreciseTimer, _context.get(),
                       [task = std::move(task)]() noexcept { task(); });
}

std::unique_ptr<Timer> QtMainQueue::repeating(std::chrono::nanoseconds interval, Task action) {
    return std::make_unique<QtTimer>(interval, std::move(action));
}

} // namespace velmora
