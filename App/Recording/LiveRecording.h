// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Clock.h"
#include "Platform/MainQueue.h"
#include "Platform/Result.h"
#include "Recorder/RecordingSession.h"

#include <cstddef>
#include <functional>
#include <memory>
#include <string>
#include <string_view>

namespace velmora {

/// What is received, as it goes into a file: with identities masked where they are masked on the screen. The
/// file is written as `velmora-log record` writes its: saved twice a second, and continued beside itself
/// where others change it; what cannot be written waits in memory, and its loss is counted. Main thread only.
class LiveRecording {
public:
    struct Events {
        /// `status` has changed.
        std::function<void()> changed;
        /// It has ended by itself, with all that could be saved; runs from the main queue.
        std::function<void(const std::string& reason)> ended;
    };

    /// Creates the file, readable for its user alone, with another name where there is one of that name.
    /// Queue and clock must outlive it.
    static Result<std::unique_ptr<LiveRecording>> start(MainQueue& queue, const Clock& clock,
                                                        const std::string& path, Events events);
    /// Stops, unless that has been done.
    ~LiveRecording();
    LiveRecording(const LiveRecording&) = delete;
    LiveRecording& operator=(const LiveRecording&) = delete;

    /// The service has named its technology. Another one than before ends the recording.
    void setTechnology(std::string_view technology);
    /// A message has arrived. Those before the technology is known are left out.
    void take(const Data& message);
    /// A note of the user's about this moment: it is written with the next message.
    void note(std::string text);
    /// The connection has come or gone: the log says so.
    void setConnected(bool isConnected);
    /// Saves what is there, and returns what has been recorded, for people: "Recorded 1200 messages, 88 KiB,
    /// in DIRECTORY/NAME." A failure has the reason of what is missing.
    Result<std::string> stop();

    [[nodiscard]] const std::string& file() const { return _session->file(); }
    /// "Recording: 88 KiB, 1200 messages, 0:12", with what waits or is lost.
    [[nodiscard]] std::string status() const;
    /// What keeps the file from being written; empty where nothing does.
    [[nodiscard]] std::string problem() const;

private:
    LiveRecording(MainQueue& queue, const Clock& clock, std::unique_ptr<RecordingSession> session,
                  Events events);

    void save();
    void check(const Result<Done>& result);
    void reportMoves();

    MainQueue& _queue;
    const Clock& _clock;
    std::unique_ptr<RecordingSession> _session;
    Events _events;
    Time _started;
    std::unique_ptr<Timer> _saving;
    std::size_t _reportedMoves = 0;
    bool _isConnected = false;
    bool _hasBeenConnected = false;
    bool _hasEnded = false;
    std::shared_ptr<bool> _isAlive = std::make_shared<bool>(true); ///< for what is queued
};

} // namespace velmora
