// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recorder/RecordingSession.h"
#include "Tools/LogOverride.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>

namespace velmora {

/// Reports to the user while a recording is made: messages on standard error and in the log, and a line of
/// progress where standard error is a terminal. Main thread only.
class RecordingNews {
public:
    /// `session` must outlive this.
    RecordingNews(const RecordingSession& session, Time started);

    /// A message for the user.
    void inform(const std::string& text);
    /// A message that the user must get even without looking at the terminal: it goes to the log as well.
    void notify(const std::string& text);
    /// Reports each file that the recording was continued in, once.
    void reportMoves();
    /// Reports each change once: a temporary error, dropped messages, the end of the error.
    void reportWriteError();

    void showProgress(Time now, bool isConnected);
    void endProgress() { _progress.reset(); }

private:
    const RecordingSession& _session;
    Time _started;
    std::unique_ptr<ProgressLine> _progress;
    std::size_t _reportedMoves = 0;
    bool _reportedError = false;
    bool _reportedDropping = false;
    std::uint64_t _droppedBefore = 0; ///< in all earlier errors
};

} // namespace velmora
