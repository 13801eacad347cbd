// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Support/FakeMainQueue.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

class FakeMainQueueTest : public testing::Test {
protected:
    MainQueue::Task note(const std::string& name) {
        return [this, name] {
            _notes.push_back(name + "@" + std::to_string((_clock.now() - FakeClock::defaultNow()) / 1ms));
        };
    }

    FakeClock _clock;
    FakeMainQueue _queue{_clock};
    std::vector<std::string> _notes;
};

TEST_F(FakeMainQueueTest, RunsTasksInOrderAndNeverInsideAsync) {
    _queue.async([this] {
        note("a")();
        _queue.async(note("c"));
        note("a still")();
    });
    _queue.async(note("b"));
    EXPECT_THAT(_notes, IsEmpty());
    EXPECT_EQ(_queue.pendingCount(), 2U);
    _queue.runPending();
    EXPECT_THAT(_notes, ElementsAre("a@0", "a still@0", "b@0", "c@0"));
    EXPECT_EQ(_queue.pendingCount(), 0U);
}

TEST_F(FakeMainQueueTest, RunsDelayedTasksAndTicksInTheOrderOfTheirTime) {
    const auto timer = _queue.repeating(2s, note("tick"));
    _queue.after(5s, note("late"));
    _queue.after(1s, [this] {
        note("early")();
        _queue.async(note("queued"));
        _queue.after(1500ms, note("nested"));
    });
    EXPECT_EQ(_queue.delayedCount(), 2U);
    EXPECT_EQ(_queue.timerCount(), 1U);

    _queue.advance(999ms);
    EXPECT_THAT(_notes, IsEmpty());
    _queue.advance(1ms);
    EXPECT_THAT(_notes, ElementsAre("early@1000", "queued@1000"));
    _queue.advance(4s);
    EXPECT_THAT(_notes, ElementsAre("early@1000", "queued@1000", "tick@2000", "nested@2500", "tick@4000",
                                    "late@5000"));
    EXPECT_EQ(_clock.now(), FakeClock::defaultNow() + 5s);
}

TEST_F(FakeMainQueueTest, RunsWhatIsDueAtTheSameMomentInTheOrderOfMaking) {
    _queue.after(2s, note("first"));
    const auto timer = _queue.repeating(2s, note("tick"));
    _queue.after(2s, note("second"));
    _queue.advance(2s);
    EXPECT_THAT(_notes, ElementsAre("first@2000", "tick@2000", "second@2000"));
}

TEST_F(FakeMainQueueTest, ZeroDelayWaitsForAdvance) {
    _queue.after(0s, note("now"));
    _queue.runPending();
    EXPECT_THAT(_notes, IsEmpty());
    _queue.advance(0s);
    EXPECT_THAT(_notes, ElementsAre("now@0"));
}

TEST_F(FakeMainQueueTest, SettingTheClockMovesNoTask) {
    _queue.after(2s, note("task"));
    _clock.setNow(FakeClock::defaultNow() + 1h);
    _queue.advance(1s);
    EXPECT_THAT(_notes, IsEmpty());
    _queue.advance(1s);
    EXPECT_THAT(_notes, ElementsAre("task@3602000"));
}

TEST_F(FakeMainQueueTest, InvalidatedOrDestroyedTimersTickNoMore) {
    auto invalidated = _queue.repeating(1s, note("invalidated"));
    auto destroyed = _queue.repeating(1s, note("destroyed"));
    _queue.advance(1s);
    EXPECT_THAT(_notes, ElementsAre("invalidated@1000", "destroyed@1000"));
    invalidated->invalidate();
    destroyed.reset();
    EXPECT_EQ(_queue.timerCount(), 0U);
    _queue.advance(10s);
    EXPECT_EQ(_notes.size(), 2U);
}

TEST_F(FakeMainQueueTest, TimerMayBeDestroyedFromItsOwnAction) {
    const auto held = std::make_shared<int>(7);
    std::unique_ptr<Timer> timer;
    int seenAfterwards = 0;
    timer = _queue.repeating(1s, [held, &timer, &seenAfterwards] {
        timer.reset();
        seenAfterwards = *held;
    });
    _queue.advance(5s);
    EXPECT_EQ(seenAfterwards, 7);
    EXPECT_EQ(_queue.timerCount(), 0U);
    EXPECT_EQ(held.use_count(), 1) << "the action is dropped with its timer";
}

TEST_F(FakeMainQueueTest, TicksMissedByABusyActionAreNotMadeUpFor) {
    bool busy = true;
    const auto timer = _queue.repeating(1s, [&] {
        note("tick")();
        if (std::exchange(busy, false))
            _queue.advance(2500ms); // the thread is held up until 3.5 s
    });
    _queue.advance(4s);
    EXPECT_THAT(_notes, ElementsAre("tick@1000", "tick@4000"));
}

TEST_F(FakeMainQueueTest, TimerMayOutliveTheQueue) {
    std::unique_ptr<Timer> timer;
    {
        FakeMainQueue queue(_clock);
        timer = queue.repeating(1s, note("tick"));
    }
    timer->invalidate();
    timer.reset();
    EXPECT_THAT(_notes, IsEmpty());
}

TEST_F(FakeMainQueueTest, TasksWithoutEndAreReported) {
    std::function<void()> again = [&] { _queue.async(again); };
    _queue.async(again);
    EXPECT_THROW(_queue.runPending(), std::runtime_error);
}

} // namespace
} // namespace velmora
