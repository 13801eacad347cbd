// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/OpenMessages.h"
#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <csignal>
#include <memory>

namespace velmora {
namespace {

using testing::ElementsAre;

/// The programs with the telephony service that they are made for, as processes of their own.
class ServiceProcessTest : public ToolTest {
protected:
    [[nodiscard]] std::unique_ptr<ToolProcess> startService(const std::string& source) const {
        return std::make_unique<ToolProcess>(tool({"--source", source}),
                                             VELMORA_BUILD_DIR "/velmora-telephonyd");
    }
};

TEST_F(ServiceProcessTest, RecorderRecordsWhatTheServiceReplays) {
    std::vector<TimedMessage> messages;
    for (std::uint8_t i = 0; i < 200; ++i)
        messages.push_back({at(i), rrState(i)});
    writeRecording("source.pcapng", "Ostrel_GSM", messages);
    const auto service = startService("replay:" + path("source.pcapng") + ",speed=max");
    ToolProcess recorder(tool({"record", "--count", "200", path("copy.pcapng")}));
    ASSERT_EQ(recorder.exitStatus(), 0) << recorder.errors();

    const auto reader = openMessages(path("copy.pcapng"));
    ASSERT_TRUE(reader) << reader.reason();
    for (const TimedMessage& message : messages) {
        const auto copy = (*reader)->next();
        ASSERT_TRUE(copy);
        EXPECT_EQ(copy->message, message.message);
    }
    EXPECT_FALSE((*reader)->next());

    ToolProcess original(tool({"decode", "--format", "json", path("source.pcapng")}));
    ToolProcess copied(tool({"decode", "--format", "json", path("copy.pcapng")}));
    EXPECT_EQ(original.exitStatus(), 0);
    EXPECT_EQ(copied.exitStatus(), 0);
    EXPECT_EQ(copied.output(), original.output());
}

TEST_F(ServiceProcessTest, WatcherOutlivesAServiceThatIsKilled) {
    auto service = startService("scenario:gsm,seed=1,speed=20");
    ToolProcess watcher(tool({"watch"}));
    auto place = watcher.waitFor("RR State");
    ASSERT_TRUE(place);
    service->signal(SIGKILL);
    EXPECT_EQ(service->exitStatus(), 128 + SIGKILL);
    place = watcher.waitFor("\n\nConnecting...\n", *place);
    ASSERT_TRUE(place);
    service = startService("scenario:gsm,seed=1,speed=20");
    // The rows that it had may be shown once more before it is connected.
    place = watcher.waitFor("\nUpdated ", *place);
    ASSERT_TRUE(place);
    ASSERT_TRUE(watcher.waitFor("RR State", *place));

    watcher.signal(SIGINT);
    EXPECT_EQ(watcher.exitStatus(), 0);
    service->signal(SIGTERM);
    EXPECT_EQ(service->exitStatus(), 0);
    EXPECT_THAT(portFiles(), ElementsAre());
}

} // namespace
} // namespace velmora
