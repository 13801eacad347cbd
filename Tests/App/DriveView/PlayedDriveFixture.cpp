// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/DriveView/PlayedDriveFixture.h"

#include "Recording/Pcapng/PcapngWriter.h"
#include "Telephony/Drives/ScenarioRegistry.h"

#include <QWidget>

#include <algorithm>
#include <chrono>

namespace velmora {

std::string PlayedDriveFixture::record(const char* scenario, std::size_t count) {
    const std::unique_ptr<Scenario> drive = scenarioKindNamed(scenario)->make(1);
    const std::string path = (directory / (std::string(scenario) + ".pcapng")).string();
    auto writer = PcapngWriter::create(path, drive->technology());
    if (!writer) {
        ADD_FAILURE() << writer.reason();
        return path;
    }
    Time earlier{};
    while (messages.size() < count) {
        const ScenarioEvent event = drive->next();
        const Time time =
            std::max(FakeClock::defaultNow() + event.offset, earlier + std::chrono::nanoseconds(1));
        earlier = time;
        messages.push_back({time, event.message});
        EXPECT_TRUE((*writer)->append(time, event.message.bytes()));
    }
    EXPECT_TRUE((*writer)->close());
    return path;
}

void PlayedDriveFixture::openIn(int width, int height, const std::string& path) {
    app.setRecording(path, {});
    launch();
    resize(width, height);
    platform.queue.runPending();
    runUntilIdle();
    ASSERT_TRUE(app.playback());
    playback().pause();
    for (int i = 0; i < 2000 && !playback().index().isComplete(); ++i)
        platform.queue.advance(std::chrono::milliseconds(2));
    ASSERT_TRUE(playback().index().isComplete());
    playback().seekToMessage(0);
    runUntilIdle();
}

} // namespace velmora
