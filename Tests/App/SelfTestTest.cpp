// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/SelfTest.h"
#include "Tests/App/AppFixture.h"
#include "Toolkit/Application.h"

#include <chrono>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::Contains;

class SelfTestTest : public AppFixture {
protected:
    /// Lets virtual time pass while the screens are drawn, until the application is to end.
    void runSelfTest() {
        for (int i = 0; i < 200 && log.textsAt(LogPriority::Notice).empty() && !failed(); ++i) {
            platform.queue.advance(20ms);
            runUntilIdle();
        }
    }
    [[nodiscard]] bool failed() const {
        for (const std::string& line : log.textsAt(LogPriority::Error))
            if (line.starts_with("Self-test"))
                return true;
        return false;
    }
};

TEST_F(SelfTestTest, OpensEveryPaneAndTheSaveScreen) {
    launchAndConnect();
    SelfTest test(app, 60s);
    // The root, A, B, and C, which is empty.
    ASSERT_TRUE(platform.ports.deliver(
        logChannelPortName(), 0,
        bytes(dictionary({{"A", dictionary({{"B", dictionary({{"x", "1"}, {"y", "2"}})}, {"b", "3"}})},
                          {"C", Value(makeArray())}}))));
    platform.queue.advance(2s);
    runSelfTest();
    EXPECT_THAT(log.textsAt(LogPriority::Notice), Contains("Self-test: opened 4 panes and the save screen"));
    EXPECT_EQ(depth(), 1u);
    EXPECT_EQ(saveScreen(), nullptr);
    EXPECT_EQ(app.run(), 0);
}

TEST_F(SelfTestTest, WithoutDataEndsInTime) {
    launchAndConnect();
    SelfTest test(app, 1s);
    platform.queue.advance(2s);
    runSelfTest();
    EXPECT_THAT(log.textsAt(LogPriority::Error), Contains("Self-test: no data came"));
    EXPECT_EQ(app.run(), 1);
}

} // namespace
} // namespace velmora
