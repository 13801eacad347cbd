// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Record/Recorder.h"

#include "Platform/Linux/SignalWatcher.h"
#include "Platform/TelephonyService.h"
#include "Tools/ExitStatus.h"
#include "Tools/Report.h"
#include "Tools/Technologies.h"

#include <chrono>
#include <cmath>
#include <cstdint>
#include <string>
#include <utility>

namespace velmora {

namespace {

using namespace std::chrono_literals;

/// How long a message may be buffered, which leaves the rest of a second for the sync.
constexpr auto saveInterval = 500ms;
/// How often writing is retried while the file cannot be written, and the progress is shown.
constexpr auto progressInterval = 1s;

std::chrono::nanoseconds nanosecondsOf(double seconds) {
    return std::chrono::nanoseconds(static_cast<std::int64_t>(std::llround(seconds * 1e9)));
}

} // namespace

Recorder::Recorder(const RecordOptions& options, RecordingSession& session, DecoderLines& lines,
                   ServiceClient& client, RecordedPositions& positions)
    : _options(options), _session(session), _client(client), _positions(positions),
      _news(session, client.clock.now()),
      _link(client, lines,
            {[this](std::string_view technology, bool hasDecoder) { return learn(technology, hasDecoder); },
             [this](const Data& message) { take(message); }, [this] { endWithSource(); },
             [this](const std::string& text) {
                 _hasTechnology = false;
                 _news.notify(text);
             },
             [this](const std::string& text) { welcome(text); },
             [this](const std::string& text) { _news.inform(text); }}) {}

int Recorder::run() {
    const WorkContext context(serviceTitle, [this] {
        _session.removeIfEmpty();
        _link.close();
    });
    const SignalWatcher signals([this](int) { end(ExitStatus::Done); });
    _link.start();
    if (_options.duration_seconds)
        _client.queue.after(nanosecondsOf(*_options.duration_seconds), [this] { end(ExitStatus::Done); });
    if (_options.timeout_seconds)
        _client.queue.after(nanosecondsOf(*_options.timeout_seconds), [this] { giveUp(); });
    const std::unique_ptr<Timer> saving = _client.queue.repeating(saveInterval, [this] { save(); });
    const std::unique_ptr<Timer> retrying = _client.queue.repeating(progressInterval, [this] { retry(); });
    _positions.start(_client, {[this](Time time, std::string_view sentence) { takeSentence(time, sentence); },
                               [this](const std::string& text) { _news.notify(text); }});
    showProgress();
    const int status = _client.loop.run();
    _positions.stop();
    _link.close();
    _news.endProgress();
    return status;
}

/// The service has named the technology. Returns whether to start streaming.
bool Recorder::learn(std::string_view technology, bool hasDecoder) {
    if (!hasDecoder)
        return check(Failure{"the telephony service speaks " + std::string(shortTechnologyName(technology)) +
                             ", which has no decoder here, wanted one of " + technologyNames()});
    _hasTechnology = true;
    return check(_session.setTechnology(technology));
}

void Recorder::take(const Data& message) {
    const Time now = _client.clock.now();
    _positions.willRecord(now, message.bytes());
    if (!_ended && check(_session.append(now, message.bytes())) && _options.count &&
        _session.messages() >= *_options.count)
        end(ExitStatus::Done);
    else if (_session.isLive())
        saveSoon();
}

void Recorder::takeSentence(Time time, std::string_view sentence) {
    if (!_ended && check(_session.appendSentence(time, sentence)) && _session.isLive())
        saveSoon();
}

/// A number of messages that has not come by now does not come at all.
void Recorder::endWithSource() {
    if (!_options.count)
        return;
    _news.notify(std::string(serviceTitle) + "'s source has ended after " +
                 std::to_string(_session.messages()) + " of " + std::to_string(*_options.count) +
                 " messages");
    end(ExitStatus::BadInput);
}

/// Once the messages that have arrived are taken: those that come in a row are written together.
void Recorder::saveSoon() {
    if (std::exchange(_savesSoon, true))
        return;
    _client.queue.async([this] {
        _savesSoon = false;
        if (!_ended && _session.temporaryError().empty())
            static_cast<void>(check(_session.save()));
    });
}

void Recorder::save() {
    if (_ended)
        return;
    _link.check();
    if (_session.hasClosedReader())
        end(ExitStatus::Done);
    else if (_session.temporaryError().empty())
        static_cast<void>(check(_session.save()));
}

void Recorder::retry() {
    if (!_ended && !_session.temporaryError().empty())
        static_cast<void>(check(_session.save()));
    if (!_ended)
        showProgress();
}

/// A service that does not name a technology again is streamed from as before.
void Recorder::welcome(const std::string& text) {
    _news.notify(_hasTechnology ? text
                                : text + ", without naming its technology; recording goes on as " +
                                      _session.technology());
}

/// The service has had its time to name a technology.
void Recorder::giveUp() {
    if (_ended || !_session.technology().empty())
        return;
    _news.inform("nothing was recorded: " + timeoutMessage(_link.problem(), *_options.timeout_seconds));
    end(ExitStatus::BadInput);
}

/// Ends the recording on a failure, after reporting it. Returns whether there was none.
bool Recorder::check(const Result<Done>& result) {
    _news.reportMoves();
    if (result) {
        _news.reportWriteError();
        return true;
    }
    if (_session.hasClosedReader()) {
        end(ExitStatus::Done);
        return false;
    }
    _news.notify(result.reason());
    end(ExitStatus::BadInput);
    return false;
}

void Recorder::showProgress() {
    _news.showProgress(_client.clock.now(), _link.isConnected());
}

void Recorder::end(int status) {
    _link.end();
    if (std::exchange(_ended, true))
        return;
    _client.loop.quit(status);
}

} // namespace velmora
