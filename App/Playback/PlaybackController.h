// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/Playback/MomentTree.h"
#include "App/Playback/PlaybackPace.h"
#include "App/Playback/PlayedDrive.h"
#include "Model/VelmoraModel.h"
#include "Model/VelmoraModelNode.h"
#include "Playback/Player.h"
#include "Toolkit/Bars/PlaybackBar.h"
#include "Toolkit/Notice.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace velmora {

/// A recording on the screen: plays it, moves to what the bar's user chooses, and shows the panes what the
/// display was at the moment. The file is indexed in the background, in steps of some milliseconds; what has
/// been read of it can be played meanwhile. Main thread only.
class PlaybackController {
public:
    struct Host {
        std::function<void()> displayChanged;
        std::function<void()> noticeChanged;
        PlayedDecoder::Masking masking;
        DriveModel::RuleFiles rules; ///< of events
    };

    /// Opens the file, which plays from its front on; a snapshot is shown at its end. `technology`: of a file
    /// with several, by its short name; empty for the first. The platform's queue and clock are used.
    static Result<std::unique_ptr<PlaybackController>>
    open(const ModelPlatform& platform, const std::string& path, const std::string& technology, Host host);
    ~PlaybackController();
    PlaybackController(const PlaybackController&) = delete;
    PlaybackController& operator=(const PlaybackController&) = delete;

    [[nodiscard]] PlaybackBar& bar() { return _bar; }
    /// What the drive view shows.
    [[nodiscard]] PlayedDrive& drive() { return _drive; }
    /// The display tree of the moment; null before the first message.
    [[nodiscard]] NodeRef topLevelNodes();
    [[nodiscard]] NodeRef nodeAtPath(const std::string& path);
    [[nodiscard]] Player::Saved saved() const { return _player->saved(); }
    /// When the latest message before the moment arrived; absent at the front.
    [[nodiscard]] std::optional<Time> moment() const { return _player->now(); }
    /// How much has been read, for people; empty once all has.
    [[nodiscard]] std::string progress() const;
    /// What could not be read or decoded, and which technology is shown of several.
    [[nodiscard]] Notice notice();

    void play();
    void pause();
    [[nodiscard]] bool isPlaying() const { return _playing != nullptr; }
    void seekToMessage(std::uint64_t messages);
    void seekToTime(Time time);
    /// Begins again with the file, at the same moment: messages are masked otherwise now.
    Result<Done> reopen();

    /// Of the recording.
    [[nodiscard]] const std::string& path() const { return _path; }
    [[nodiscard]] const Player& player() const { return *_player; }
    [[nodiscard]] const RecordingIndex& index() const { return *_index; }

private:
    PlaybackController(const ModelPlatform& platform, std::string path, std::string technology, Host host);

    Result<Done> load();
    void readOn();
    void playOn();
    void run(PlaybackBar::Command command);
    /// Null for none.
    void seekToEvent(const Event* event);
    void setSpeed(std::size_t index);
    /// The moment has changed by a move of the user's, or playing begins from it.
    void moved();
    void showBar();
    [[nodiscard]] Time shownTime() const;
    void checkFile();
    void showOtherTechnology();

    ModelPlatform _platform;
    std::string _path;
    std::string _technology;
    Host _host;
    PlaybackBar _bar;
    std::unique_ptr<PlayedFile> _file;
    std::unique_ptr<RecordingIndex> _index;
    std::unique_ptr<Player> _player;
    PlayedDrive _drive;              ///< of the index and the player
    std::unique_ptr<Timer> _reading; ///< while the index is not complete
    std::unique_ptr<Timer> _playing; ///< while it plays
    PlaybackPace _pace;
    std::optional<std::uint64_t> _wanted; ///< where to go once the index has read that far
    std::string _change;                  ///< of the file since it was opened
    std::string _event;                   ///< that the moment was chosen by
    MomentTree _tree;
};

} // namespace velmora
