// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/AppPlatform.h"
#include "App/Recording/LiveRecording.h"
#include "App/Recording/RecordingBar.h"

#include <functional>
#include <memory>
#include <string>
#include <string_view>

namespace velmora {

/// Starts and stops the recording of what is received, and shows its bar. Its file goes beside the snapshots:
/// "VelmoraRecording-SECONDS.pcapng". Main thread only.
class RecordingSwitch {
public:
    /// `barsChanged` is called when the bar comes or goes, `noticeChanged` when `notice` may have changed,
    /// `noted` for each note. `platform` must outlive it.
    RecordingSwitch(AppPlatform& platform, std::function<void()> barsChanged,
                    std::function<void()> noticeChanged, std::function<void(const std::string& text)> noted);

    /// Starts, or stops what has been started. `technology`: the service's, where it is known; `isConnected`:
    /// whether it is there.
    void toggle(std::string_view technology, bool isConnected);
    /// Stops, and says what has been recorded; `reason` says why, where that was not the user.
    void stop(const std::string& reason = {});
    [[nodiscard]] bool isOn() const { return _recording != nullptr; }

    /// A message is shown.
    void take(const Data& message);
    void connectionChanged(std::string_view technology, bool isConnected);
    /// Asks for a note about this moment; without a recording it says that there is none.
    void askNote();

    /// Adds a note without asking for its text: "Bookmark".
    void bookmark();
    /// The recording's file; empty while nothing is recorded.
    [[nodiscard]] std::string file() const { return _recording ? _recording->file() : std::string(); }

    /// Null while nothing is recorded.
    [[nodiscard]] RecordingBar* bar() const { return _bar.get(); }
    /// What keeps the recording from being written, or what has been recorded last; empty for neither.
    [[nodiscard]] std::string notice() const;

private:
    void start(std::string_view technology, bool isConnected);
    void note(const std::string& text);
    void showStatus();
    void say(std::string text);

    AppPlatform& _platform;
    std::function<void()> _barsChanged;
    std::function<void()> _noticeChanged;
    std::function<void(const std::string& text)> _noted;
    std::unique_ptr<RecordingBar> _bar;
    std::unique_ptr<LiveRecording> _recording;
    std::string _outcome;
    std::string _shownNotice;
};

} // namespace velmora
