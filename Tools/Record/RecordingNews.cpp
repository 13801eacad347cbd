// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Record/RecordingNews.h"

#include "Tools/Report.h"
#include "Tools/ServiceClient.h"

#include <chrono>
#include <utility>

#include <unistd.h>

namespace velmora {

namespace {

std::string queueSize() {
    return std::to_string(PcapngWriter::maximumQueue >> 20) + " MiB";
}

} // namespace

RecordingNews::RecordingNews(const RecordingSession& session, Time started)
    : _session(session), _started(started) {
    if (::isatty(STDERR_FILENO) != 0)
        _progress = std::make_unique<ProgressLine>();
}

void RecordingNews::inform(const std::string& text) {
    if (_progress)
        _progress->clear();
    report(text);
}

void RecordingNews::notify(const std::string& text) {
    inform(text);
    logLine(LogPriority::Error, text);
}

void RecordingNews::reportMoves() {
    for (; _reportedMoves < _session.moves().size(); ++_reportedMoves) {
        const RecordingSession::Move& move = _session.moves()[_reportedMoves];
        notify(move.reason + "; recording goes on into " + move.file);
    }
}

void RecordingNews::reportWriteError() {
    const bool hasError = !_session.temporaryError().empty();
    if (hasError && !_reportedError)
        notify(_session.temporaryError() + "; recording goes on when it can be, until then up to " +
               queueSize() + " of messages wait");
    if (_session.isDropping() && !_reportedDropping)
        notify(queueSize() + " of messages wait for " + _session.file() + "; further ones are dropped");
    if (!hasError && _reportedError) {
        const std::uint64_t dropped = _session.dropped() - _droppedBefore;
        notify(_session.file() + " can be written again; " + (dropped == 0 ? "no" : std::to_string(dropped)) +
               " messages were dropped");
        _droppedBefore = _session.dropped();
    }
    _reportedError = hasError;
    _reportedDropping = _session.isDropping();
}

void RecordingNews::showProgress(Time now, bool isConnected) {
    if (!_progress)
        return;
    const auto elapsed = std::chrono::floor<std::chrono::seconds>(now - _started);
    std::string text = std::to_string(_session.messages()) + " messages, " +
                       std::to_string(_session.bytes()) + " bytes, " + std::to_string(elapsed.count()) + " s";
    if (!isConnected)
        text += std::string("; waiting for ") + serviceTitle;
    if (!_session.temporaryError().empty())
        text += "; " + std::to_string(_session.unsaved().messages) + " wait to be written";
    _progress->show(text);
}

} // namespace velmora
