// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/DateText.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/FakeTelephonyService.h"
#include "Tests/Support/Hex.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(CapturedLog, KeepsLinesAndPutsTheEarlierLogBack) {
    CapturedLog outer(LogPriority::Error);
    logLine(LogPriority::Error, "one");
    logLine(LogPriority::Warning, "above the outer level");
    {
        CapturedLog inner;
        logLine(LogPriority::Debug, "two");
        EXPECT_THAT(inner.lines(), ElementsAre(CapturedLog::Line{LogPriority::Debug, "two"}));
    }
    logLine(LogPriority::Warning, "above the outer level, again");
    logFormat(LogPriority::Error, "%s%d", "three", 3);
    EXPECT_THAT(outer.textsAt(LogPriority::Error), ElementsAre("one", "three3"));
    EXPECT_THAT(outer.textsAt(LogPriority::Warning), IsEmpty());
    EXPECT_TRUE(outer.contains(LogPriority::Error, "one"));
    EXPECT_FALSE(outer.contains(LogPriority::Warning, "one"));
    EXPECT_FALSE(outer.contains(LogPriority::Error, "on"));
    outer.clear();
    EXPECT_THAT(outer.lines(), IsEmpty());
}

TEST(FakeClock, HasItsDefaultUntilSet) {
    FakeClock clock;
    EXPECT_EQ(dateDescription(clock.now()), "2026-11-16 05:00:00 +0000");
    clock.setNow(Time(std::chrono::seconds(1)));
    clock.advance(std::chrono::seconds(2));
    EXPECT_EQ(clock.now(), Time(std::chrono::seconds(3)));
    EXPECT_EQ(clock.zoneAt(clock.now()).offset, std::chrono::seconds(0));
    clock.setZone({std::chrono::hours(2), true});
    EXPECT_EQ(clock.zoneAt(clock.now()).offset, std::chrono::hours(2));
    EXPECT_TRUE(clock.zoneAt(clock.now()).daylightSaving);
}

TEST(FakeTelephonyService, AnswersWhatIsSetAndCountsConnections) {
    FakeTelephonyService service;
    int refreshes = 0;
    service.callBack();
    auto connection = service._VoxServerConnectionCreate([&] { ++refreshes; });
    ASSERT_TRUE(connection);
    EXPECT_EQ(service.liveConnections(), 1);

    std::string remote;
    EXPECT_EQ(service._VoxServerConnectionNetworkMonitorCreateLogChannel(*connection, "local", remote).code,
              0);
    EXPECT_EQ(remote, "com.velmora.test.channel");
    service.error = {1, 5};
    service.remotePortName.clear();
    EXPECT_EQ(service._VoxServerConnectionNetworkMonitorCreateLogChannel(*connection, "other", remote).code,
              5);
    EXPECT_EQ(remote, "");
    EXPECT_THAT(service.localPortNames(), ElementsAre("local", "other"));

    connection.reset();
    EXPECT_EQ(service.liveConnections(), 0);
    service.callBack();
    EXPECT_EQ(refreshes, 1);
    service.available = false;
    EXPECT_FALSE(service._VoxServerConnectionCreate([] {}));
    EXPECT_EQ(service.connectionsAsked(), 2);
}

TEST(FakeResources, IsTheProcessesSetWhileItLives) {
    FakeResources outer;
    outer.put("LTE", "plist", Value("template"));
    outer.put("C2K", "plist", hex("01"));
    outer.put("C2K", "plist", hex("02"));
    outer.put("icon", "svg", hex("03"));
    {
        FakeResources inner;
        EXPECT_THAT(resources().list("plist"), IsEmpty());
    }
    EXPECT_THAT(resources().list("plist"), ElementsAre("C2K", "LTE"));
    EXPECT_EQ(*resources().read("C2K", "plist"), hex("02"));
    const auto data = resources().read("LTE", "plist");
    ASSERT_TRUE(data);
    const auto value = readPropertyList(data->bytes());
    ASSERT_TRUE(value) << value.reason();
    EXPECT_EQ(*value, Value("template"));
    EXPECT_EQ(resources().read("icon", "plist").reason(), "no resource icon.plist in memory");
    EXPECT_EQ(resources().bundleVersion(), std::nullopt);
    outer.version = "1.2";
    EXPECT_EQ(resources().bundleVersion(), "1.2");
    EXPECT_EQ(resources().buildStamp(), "Sep 11 2019 18:54:57");
}

TEST(TemporaryDirectory, IsRemovedWithWhatItHolds) {
    std::filesystem::path path;
    {
        const TemporaryDirectory directory;
        const TemporaryDirectory another;
        path = directory.path();
        EXPECT_TRUE(std::filesystem::is_empty(path));
        EXPECT_NE(path, another.path());
        std::filesystem::create_directory(directory / "inner");
        std::ofstream(directory / "inner/file") << "content";
        EXPECT_TRUE(std::filesystem::exists(path / "inner" / "file"));
    }
    EXPECT_FALSE(std::filesystem::exists(path));
}

} // namespace
} // namespace velmora
