// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/QtMainQueue.h"
#include "Platform/Linux/SignalWatcher.h"
#include "Tests/Platform/LinuxPortFixture.h"

#include <gmock/gmock.h>

#include <csignal>
#include <thread>

namespace velmora {

namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;

TEST(LinuxMainQueue, TasksRunInOrderAndNeverInsideTheCall) {
    QtMainQueue queue;
    std::vector<int> ran;
    queue.async([&] {
        ran.push_back(1);
        queue.async([&] { ran.push_back(3); });
        EXPECT_THAT(ran, ElementsAre(1));
    });
    queue.async([&] { ran.push_back(2); });
    EXPECT_TRUE(ran.empty());
    ASSERT_TRUE(eventually([&] { return ran.size() == 3; }));
    EXPECT_THAT(ran, ElementsAre(1, 2, 3));
}

TEST(LinuxMainQueue, ADelayedTaskRunsOnceAndNotEarly) {
    QtMainQueue queue;
    int ran = 0;
    const auto start = std::chrono::steady_clock::now();
    queue.after(20500us, [&] { ++ran; });
    ASSERT_TRUE(eventually([&] { return ran > 0; }));
    EXPECT_GE(std::chrono::steady_clock::now() - start, 20500us);
    turnLoop();
    EXPECT_EQ(ran, 1);
}

TEST(LinuxMainQueue, WhatIsQueuedEndsWithTheQueue) {
    int ran = 0;
    {
        QtMainQueue queue;
        queue.async([&] { ++ran; });
        queue.after(1ms, [&] { ++ran; });
    }
    turnLoop();
    EXPECT_EQ(ran, 0);
}

TEST(LinuxMainQueue, ATimerTicksUntilItIsInvalidated) {
    QtMainQueue queue;
    int ticks = 0;
    const auto timer = queue.repeating(1ms, [&] { ++ticks; });
    ASSERT_TRUE(eventually([&] { return ticks == 3; }));
    timer->invalidate();
    turnLoop();
    EXPECT_EQ(ticks, 3);
}

TEST(LinuxMainQueue, ATimerMayStopAndDestroyItselfFromItsAction) {
    QtMainQueue queue;
    int ticks = 0;
    std::unique_ptr<Timer> timer;
    timer = queue.repeating(1ms, [&] {
        ++ticks;
        timer->invalidate();
        timer.reset();
        ++ticks; // what the action holds is still there
    });
    ASSERT_TRUE(eventually([&] { return ticks == 2; }));
    turnLoop();
    EXPECT_EQ(ticks, 2);
}

TEST(LinuxMainQueue, MissedTicksAreNotMadeUpFor) {
    QtMainQueue queue;
    int ticks = 0;
    const auto timer = queue.repeating(10ms, [&] {
        if (++ticks == 1)
            std::this_thread::sleep_for(100ms); // a busy main thread
    });
    const auto start = std::chrono::steady_clock::now();
    ASSERT_TRUE(eventually([&] { return std::chrono::steady_clock::now() - start >= 130ms; }));
    // One at 10 ms, one right after the pause, and those that are due since; nine more would have been
    // missed.
    EXPECT_GE(ticks, 2);
    EXPECT_LE(ticks, 6);
}

TEST(LinuxMainLoop, QuitGivesItsStatus) {
    QtMainQueue queue;
    queue.async([] {
        testLoop().quit(3);
        testLoop().quit(4); // the first counts
    });
    EXPECT_EQ(testLoop().run(), 3);
    testLoop().quit(5);
    EXPECT_EQ(testLoop().run(), 5);
}

TEST(LinuxMainLoop, RunUntilHasAnEnd) {
    EXPECT_FALSE(testLoop().runUntil([] { return false; }, 5ms));
    EXPECT_TRUE(testLoop().runUntil([] { return true; }, 0ms));
}

TEST(LinuxSignalWatcher, SignalsArriveOnTheMainThreadAndPipesBreakWithoutOne) {
    const auto earlier = ::signal(SIGHUP, SIG_DFL); // nohup's children inherit an ignored one
    std::vector<int> seen;
    {
        const SignalWatcher watcher([&](int signalNumber) { seen.push_back(signalNumber); });
        EXPECT_FALSE(SignalWatcher::hasSignal());
        ASSERT_EQ(::raise(SIGTERM), 0);
        ASSERT_EQ(::raise(SIGINT), 0);
        ASSERT_EQ(::raise(SIGHUP), 0);
        ASSERT_EQ(::raise(SIGPIPE), 0);
        EXPECT_TRUE(seen.empty());
        EXPECT_TRUE(SignalWatcher::hasSignal());
        ASSERT_TRUE(eventually([&] { return seen.size() == 3; }));
        EXPECT_FALSE(SignalWatcher::hasSignal());
    }
    EXPECT_THAT(seen, ElementsAre(SIGTERM, SIGINT, SIGHUP));
    ::signal(SIGHUP, earlier);
}

TEST(LinuxSignalWatcher, AnIgnoredHangUpStaysIgnored) {
    const auto earlier = ::signal(SIGHUP, SIG_IGN);
    std::vector<int> seen;
    {
        const SignalWatcher watcher([&](int signalNumber) { seen.push_back(signalNumber); });
        ASSERT_EQ(::raise(SIGHUP), 0);
        ASSERT_EQ(::raise(SIGTERM), 0);
        ASSERT_TRUE(eventually([&] { return !seen.empty(); }));
    }
    EXPECT_THAT(seen, ElementsAre(SIGTERM));
    EXPECT_EQ(::signal(SIGHUP, earlier), SIG_IGN);
}

TEST(LinuxSignalWatcher, TheEarlierHandlersComeBack) {
    std::unique_ptr<SignalWatcher> watcher;
    int seen = 0;
    const auto earlier = ::signal(SIGTERM, SIG_IGN);
    watcher = std::make_unique<SignalWatcher>([&](int) {
        ++seen;
        watcher.reset();
        ++seen;
    });
    EXPECT_THROW(SignalWatcher([](int) {}), std::logic_error);
    ASSERT_EQ(::raise(SIGTERM), 0);
    ASSERT_TRUE(eventually([&] { return seen == 2; }));
    ASSERT_EQ(::raise(SIGTERM), 0); // ignored again
    turnLoop();
    EXPECT_EQ(seen, 2);
    ::signal(SIGTERM, earlier);
}

} // namespace

} // namespace velmora
