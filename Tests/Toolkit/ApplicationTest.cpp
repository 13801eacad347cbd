// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/ToolkitTest.h"

#include "Toolkit/ApplicationDelegate.h"

#include <chrono>
#include <csignal>
#include <stdexcept>

namespace velmora {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class ApplicationTest : public ::testing::Test, public ApplicationDelegate {
protected:
    void applicationDidFinishLaunching(Application& application) override {
        EXPECT_EQ(&application, &testApplication());
        log.emplace_back("launched");
        if (onLaunch)
            onLaunch();
    }
    void applicationWillTerminate(Application& /*application*/) override { log.emplace_back("terminates"); }

    std::vector<std::string> log;
    std::function<void()> onLaunch;
};

TEST_F(ApplicationTest, RunsUntilItIsTerminated) {
    onLaunch = [] {
        testApplication().terminate(3);
        testApplication().terminate(4);
    };
    EXPECT_EQ(testApplication().run(*this), 3);
    EXPECT_THAT(log, ElementsAre("launched", "terminates"));
}

TEST_F(ApplicationTest, TerminatedBeforeItRuns) {
    testApplication().terminate(2);
    EXPECT_EQ(testApplication().run(*this), 2);
    EXPECT_THAT(log, IsEmpty());
}

TEST_F(ApplicationTest, SignalsEndIt) {
    for (const int number : {SIGTERM, SIGINT}) {
        log.clear();
        onLaunch = [number] { (void)std::raise(number); };
        EXPECT_EQ(testApplication().run(*this), 0);
        EXPECT_THAT(log, ElementsAre("launched", "terminates"));
    }
}

TEST_F(ApplicationTest, ClosingTheLastWindowEndsIt) {
    Window window({0, 0, 300, 400});
    onLaunch = [&window] {
        window.makeKeyAndVisible();
        window.widget()->close();
    };
    EXPECT_EQ(testApplication().run(*this), 0);
    EXPECT_THAT(log, ElementsAre("launched", "terminates"));
}

TEST_F(ApplicationTest, RunsOnce) {
    onLaunch = [this] {
        EXPECT_THROW((void)testApplication().run(*this), std::logic_error);
        testApplication().terminate();
    };
    EXPECT_EQ(testApplication().run(*this), 0);
}

TEST_F(ApplicationTest, ServesEventsUntilACondition) {
    int looks = 0;
    EXPECT_TRUE(testApplication().runUntil([&] { return ++looks > 0; }, std::chrono::seconds(10)));
    EXPECT_EQ(looks, 1);
    EXPECT_FALSE(testApplication().runUntil([] { return false; }, std::chrono::milliseconds(1)));
    EXPECT_EQ(Application::shared(), &testApplication());
}

} // namespace
} // namespace velmora
