// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/DriveView/DriveSource.h"
#include "Playback/Player.h"
#include "Playback/RecordedDrive.h"

#include <functional>

namespace velmora {

/// The drive of a recording that is played: the serving cell and its neighbours at the player's moment, and
/// the samples and events of all that has been read. It is made while the recording's index is. Main thread
/// only.
class PlayedDrive final : public DriveSource {
public:
    struct Host {
        std::function<void(Time)> choose;      ///< moves the player
        std::function<void()> readAgain;       ///< from the front, since another row is pinned
        std::function<std::string()> progress; ///< of reading
    };

    /// `rules`: as DriveModel. All must outlive it.
    PlayedDrive(const Clock& clock, DriveModel::RuleFiles rules, Host host);

    /// Shows another player, of an index of which nothing has been read. Both must outlive this, or be taken
    /// off with nulls.
    void setPlayer(RecordingIndex* index, const Player* player);
    /// The player's moment is another, or more has been read.
    void changed() { ++_revision; }

    [[nodiscard]] RecordedDrive& recorded() { return _recorded; }

    [[nodiscard]] const DriveModel& model() const override { return _recorded.model(); }
    [[nodiscard]] const DriveHistory& history() const override { return _history; }
    [[nodiscard]] DriveNow now() const override;
    [[nodiscard]] std::span<const Neighbour> neighbours() const override;
    [[nodiscard]] Time moment() const override;
    [[nodiscard]] Time end() const override;
    [[nodiscard]] std::uint64_t revision() const override { return _revision; }
    [[nodiscard]] std::string link() const override { return {}; }
    [[nodiscard]] std::string progress() const override { return _host.progress(); }
    [[nodiscard]] bool isRecorded() const override { return true; }
    void choose(Time time) override { _host.choose(time); }
    bool togglePin(const std::string& path) override;

private:
    DriveHistory _history;
    RecordedDrive _recorded;
    Host _host;
    RecordingIndex* _index = nullptr;
    const Player* _player = nullptr;
    std::uint64_t _revision = 0;
};

} // namespace velmora
