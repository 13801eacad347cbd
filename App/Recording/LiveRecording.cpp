// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Recording/LiveRecording.h"

#include "App/Recording/SizeText.h"
#include "Platform/SystemLog.h"

#include <chrono>
#include <filesystem>
#include <system_error>
#include <utility>

namespace velmora {

namespace {

using namespace std::chrono_literals;

/// As velmora-log record saves: how long a message may be buffered.
constexpr auto saveInterval = 500ms;

std::string freeName(const std::string& path) {
    const std::filesystem::path wanted(path);
    std::filesystem::path name = wanted;
    std::error_code error;
    for (int number = 2; std::filesystem::exists(std::filesystem::symlink_status(name, error)); ++number)
        name.replace_filename(wanted.stem().string() + "-" + std::to_string(number) +
                              wanted.extension().string());
    return name.string();
}

std::string messagesText(std::uint64_t count) {
    return std::to_string(count) + (count == 1 ? " message" : " messages");
}

} // namespace

Result<std::unique_ptr<LiveRecording>> LiveRecording::start(MainQueue& queue, const Clock& clock,
                                                            const std::string& path, Events events) {
    Result<std::unique_ptr<RecordingSession>> session = RecordingSession::open(freeName(path), false);
    if (!session)
        return Failure{session.reason()};
    return std::unique_ptr<LiveRecording>(
        new LiveRecording(queue, clock, *std::move(session), std::move(events)));
}

LiveRecording::LiveRecording(MainQueue& queue, const Clock& clock, std::unique_ptr<RecordingSession> session,
                             Events events)
    : _queue(queue), _clock(clock), _session(std::move(session)), _events(std::move(events)),
      _started(clock.now()), _saving(queue.repeating(saveInterval, [this] { save(); })) {}

LiveRecording::~LiveRecording() {
    *_isAlive = false;
    if (const Result<std::string> stopped = stop(); !stopped)
        logLine(LogPriority::Error, stopped.reason());
}

void LiveRecording::setTechnology(std::string_view technology) {
    if (!_hasEnded && !technology.empty())
        check(_session->setTechnology(technology));
}

void LiveRecording::take(const Data& message) {
    if (!_hasEnded && !_session->technology().empty())
        check(_session->append(_clock.now(), message.bytes()));
}

void LiveRecording::note(std::string text) {
    if (!_hasEnded)
        _session->note(std::move(text));
}

void LiveRecording::setConnected(bool isConnected) {
    if (_isConnected == isConnected)
        return;
    _isConnected = isConnected;
    if (!isConnected)
        logLine(LogPriority::Error, "recording: the telephony service is gone; waiting for it");
    else if (std::exchange(_hasBeenConnected, true))
        logLine(LogPriority::Error, "recording: the telephony service is back");
    _events.changed();
}

void LiveRecording::save() {
    if (_hasEnded)
        return;
    check(_session->save());
    _events.changed();
}

void LiveRecording::reportMoves() {
    for (; _reportedMoves < _session->moves().size(); ++_reportedMoves) {
        const RecordingSession::Move& move = _session->moves()[_reportedMoves];
        logLine(LogPriority::Error, "recording: " + move.reason + "; it goes on into " + move.file);
    }
}

/// A failure ends the recording. A notice says once that what has failed is over.
void LiveRecording::check(const Result<Done>& result) {
    reportMoves();
    if (result || std::exchange(_hasEnded, true))
        return;
    logLine(LogPriority::Error, "recording: " + result.reason());
    _queue.async([this, alive = _isAlive, reason = result.reason()] {
        if (!*alive)
            return;
        const auto ended = _events.ended; // the call destroys this
        ended(reason);
    });
}

Result<std::string> LiveRecording::stop() {
    if (!_saving)
        return std::string();
    _saving.reset();
    _hasEnded = true;
    const Result<Done> closed = _session->close();
    reportMoves();
    const pcapngBlocks::PacketCount unsaved = _session->unsaved();
    const std::uint64_t missing = unsaved.messages + _session->dropped();
    std::string text = "Recorded " + messagesText(_session->messages() - unsaved.messages) + ", " +
                       sizeText(_session->bytes() - unsaved.bytes) + ", in " + _session->file();
    for (const RecordingSession::Move& move : _session->moves())
        text += " (" + move.reason + ")";
    text += ".";
    if (_session->waitingNotes() > 0)
        text += " The last note is not in it, since no message followed.";
    if (missing > 0 || !closed)
        return Failure{text + " " + messagesText(missing) + (missing == 1 ? " is" : " are") + " missing" +
                       (closed ? "." : ": " + closed.reason() + ".")};
    return text;
}

std::string LiveRecording::status() const {
    const auto elapsed = std::chrono::floor<std::chrono::seconds>(_clock.now() - _started).count();
    const std::string seconds = std::to_string(elapsed % 60);
    std::string text = "Recording: " + sizeText(_session->bytes()) + ", " +
                       messagesText(_session->messages()) + ", " + std::to_string(elapsed / 60) + ":" +
                       (seconds.size() == 1 ? "0" : "") + seconds;
    if (_session->dropped() > 0)
        text += ", " + std::to_string(_session->dropped()) + " lost";
    return text;
}

std::string LiveRecording::problem() const {
    if (_session->temporaryError().empty())
        return {};
    return "The recording cannot be written: " + _session->temporaryError() + ". " +
           messagesText(_session->unsaved().messages) +
           (_session->isDropping() ? " wait, further ones are lost." : " wait until it can.");
}

} // namespace velmora
