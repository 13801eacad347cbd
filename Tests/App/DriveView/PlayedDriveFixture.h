// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/Playback/PlaybackController.h"
#include "Tests/App/DriveView/DriveFixture.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace velmora {

/// The application with the drive view and a recording of a synthetic drive.
class PlayedDriveFixture : public DriveFixture {
protected:
    struct RecordedMessage {
        Time time;
        Data message;
    };

    /// Writes the first messages of a scenario's drive, at times of their own.
    std::string record(const char* scenario, std::size_t messages);
    /// Shows the recording, in a window of that size, at its front.
    void openIn(int width, int height, const std::string& path);

    [[nodiscard]] PlaybackController& playback() const { return *app.playback(); }
    /// Of what was recorded.
    std::vector<RecordedMessage> messages;
};

} // namespace velmora
