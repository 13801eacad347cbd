// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/PeerLog.h"

#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeMainQueue.h"

#include <gmock/gmock.h>

#include <optional>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

class PeerLogTest : public ::testing::Test {
protected:
    void write(int count, const char* kind = "odd requests") {
        for (int i = 0; i < count; ++i)
            peers->format(LogPriority::Error, kind, "request %d of %s", i, "a peer");
    }

    FakeClock clock;
    FakeMainQueue queue{clock};
    CapturedLog log;
    std::optional<PeerLog> peers{std::in_place, queue};
};

TEST_F(PeerLogTest, TenLinesASecondAreWrittenAndNothingElse) {
    write(10);
    EXPECT_EQ(log.lines().size(), 10U);
    EXPECT_EQ(log.lines()[9], (CapturedLog::Line{3, "request 9 of a peer"}));
    queue.advance(2s);
    EXPECT_EQ(log.lines().size(), 10U) << "nothing was left out";
    EXPECT_EQ(queue.delayedCount(), 0U) << "an idle log needs no timer";
}

TEST_F(PeerLogTest, LinesBeyondAreCountedWhenTheSecondIsOver) {
    write(10);
    log.clear();
    queue.advance(900ms);
    write(53);
    EXPECT_THAT(log.lines(), IsEmpty());
    queue.advance(100ms);
    EXPECT_THAT(log.lines(), ElementsAre(CapturedLog::Line{3, "odd requests: 53 more within a second"}));
    log.clear();
    write(12);
    EXPECT_EQ(log.lines().size(), 10U) << "a new second";
    queue.advance(1s);
    EXPECT_EQ(log.lines().back().text, "odd requests: 2 more within a second");
}

TEST_F(PeerLogTest, KindsAreLimitedSeparately) {
    write(11);
    log.clear();
    write(1, "refused connections");
    EXPECT_THAT(log.textsAt(LogPriority::Error), ElementsAre("request 0 of a peer"));
    queue.advance(1s);
    EXPECT_THAT(log.textsAt(LogPriority::Error),
                ElementsAre("request 0 of a peer", "odd requests: 1 more within a second"));
}

TEST_F(PeerLogTest, ACountIsNotLostAtTheEnd) {
    write(14);
    log.clear();
    peers.reset();
    EXPECT_THAT(log.textsAt(LogPriority::Error), ElementsAre("odd requests: 4 more within a second"));
    queue.advance(2s);
    EXPECT_EQ(log.lines().size(), 1U);
}

TEST_F(PeerLogTest, LinesThatAreNotLoggedCountNothing) {
    setSystemLog(&log, LogPriority::Error);
    for (int i = 0; i < 100; ++i)
        peers->line(LogPriority::Notice, "notices", "a peer is there");
    queue.advance(1s);
    EXPECT_THAT(log.lines(), IsEmpty());
}

} // namespace
} // namespace velmora
