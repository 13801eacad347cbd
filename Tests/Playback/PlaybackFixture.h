// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Playback/Player.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// A message with the time of its arrival.
struct DriveMessage {
    Time time;
    Data message;
};

/// The first messages of a technology's synthetic drive.
[[nodiscard]] std::vector<DriveMessage> driveOf(const char* scenario, std::size_t messages);

/// A file that is opened as the application opens it.
struct OpenedRecording {
    std::unique_ptr<PlayedFile> file;
    std::unique_ptr<RecordingIndex> index;
    std::unique_ptr<Player> player;
};

/// Recordings in a directory of their own, the templates that are shipped, and what velmora-log makes of the
/// recordings.
class PlaybackTest : public testing::Test {
protected:
    PlaybackTest();

    [[nodiscard]] std::string path(const std::string& name) const { return (_directory / name).string(); }
    void write(const std::string& name, const char* scenario,
               const std::vector<DriveMessage>& messages) const;
    void writeBytes(const std::string& name, const Data& bytes) const;

    /// Throws std::runtime_error with the reason where it cannot be opened.
    [[nodiscard]] OpenedRecording open(const std::string& name, const std::string& technology = {},
                                       RecordingIndex::Limits limits = {}) const;
    /// As above, all of it indexed.
    [[nodiscard]] OpenedRecording openAll(const std::string& name, const std::string& technology = {},
                                          RecordingIndex::Limits limits = {}) const;

    /// What `velmora-log decode --format json --to TIME` prints, without a bound the end.
    [[nodiscard]] std::string decoded(const std::string& name, std::optional<Time> to,
                                      const std::string& technology = {}) const;
    /// The snapshot that `velmora-log convert --to TIME` writes.
    [[nodiscard]] std::string snapshot(const std::string& name, std::optional<Time> to) const;
    /// The same of the player's moment.
    [[nodiscard]] static std::string shown(OpenedRecording& opened);
    [[nodiscard]] static std::string saved(const OpenedRecording& opened);

    TemporaryDirectory _directory;

private:
    CapturedLog _log{LogPriority::Emergency};
    FakeResources _resources;
};

} // namespace velmora
