// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recorder/RecordingSession.h"
#include "Tools/Record/Positions/RecordedPositions.h"
#include "Tools/Record/RecordOptions.h"
#include "Tools/Record/RecordingNews.h"
#include "Tools/Record/ServiceLink.h"
#include "Tools/ServiceClient.h"

#include <string>
#include <string_view>

namespace velmora {

/// Records what the telephony service sends until the user, a signal, a limit or a failure ends it. Main
/// thread only.
class Recorder {
public:
    /// All five must outlive this.
    Recorder(const RecordOptions& options, RecordingSession& session, DecoderLines& lines,
             ServiceClient& client, RecordedPositions& positions);

    /// Runs the client's event loop. Returns the exit status.
    int run();

private:
    bool learn(std::string_view technology, bool hasDecoder);
    void take(const Data& message);
    void takeSentence(Time time, std::string_view sentence);
    void endWithSource();
    void save();
    void saveSoon();
    void retry();
    void welcome(const std::string& text);
    void giveUp();
    bool check(const Result<Done>& result);
    void showProgress();
    void end(int status);

    const RecordOptions& _options;
    RecordingSession& _session;
    ServiceClient& _client;
    RecordedPositions& _positions;
    RecordingNews _news;
    ServiceLink
        _link; ///< whose log is over the progress line of the news: only lines that are written replace it
    bool _hasTechnology = false; ///< named since the service was lost
    bool _ended = false;
    bool _savesSoon = false; ///< a task is queued that saves what has been taken
};

} // namespace velmora
