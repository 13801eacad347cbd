// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Record/RecordCommand.h"

#include "Platform/Linux/SignalWatcher.h"
#include "Platform/TelephonyService.h"
#include "Tools/ExitStatus.h"
#include "Tools/LogSubstitute.h"
#include "Tools/Record/RecordingSession.h"
#include "Tools/Report.h"
#include "Tools/ServiceClient.h"
#include "Tools/Technologies.h"

#include <chrono>
#include <cmath>
#include <functional>
#include <memory>
#include <utility>

#include <unistd.h>

namespace velmora {

namespace {

using namespace std::chrono_literals;

/// How long a message may wait before it is in the file, which leaves the medium the rest of a second.
constexpr auto saveInterval = 500ms;
/// How often a file that cannot be written is tried again, and the progress is shown.
constexpr auto progressInterval = 1s;

std::string queueSize() {
    return std::to_string(RecordingWriter::maximumQueue >> 20) + " MiB";
}

/// A model that hands the messages on instead of decoding them. Of its decoder only the start command is
/// wanted.
class RecordingModel final : public VelmoraModel {
public:
    struct Events {
        std::function<void(const Data& message)> message;
        /// Whether messages of this technology, which has a decoder or none, are wanted.
        std::function<bool(std::string_view technology, bool hasDecoder)> technology;
    };

    RecordingModel(ModelPlatform platform, Events events)
        : VelmoraModel(std::move(platform), nullptr), _events(std::move(events)) {}

    void updateWithData(const Data& data) override { _events.message(data); }

protected:
    [[nodiscard]] std::unique_ptr<LogGenerator>
    generatorFromTechnology(std::string_view technology) override {
        std::unique_ptr<LogGenerator> decoder = VelmoraModel::generatorFromTechnology(technology);
        const bool wanted = _events.technology(technology, decoder != nullptr);
        return wanted ? std::move(decoder) : nullptr;
    }

private:
    Events _events;
};

class Recorder {
public:
    Recorder(const RecordOptions& options, RecordingSession& session, ServiceClient& client)
        : _options(options), _session(session), _client(client), _started(client.clock.now()) {
        _model = std::make_shared<RecordingModel>(
            client.platform(), RecordingModel::Events{[this](const Data& message) { take(message); },
                                                      [this](std::string_view technology, bool hasDecoder) {
                                                          return learn(technology, hasDecoder);
                                                      }});
        if (::isatty(STDERR_FILENO) != 0)
            _progress = std::make_unique<ProgressLine>();
    }

    /// Until the user, a signal, a limit or a failure ends it.
    int run() {
        const WorkContext context(serviceTitle, [this] {
            _session.removeIfEmpty();
            _model->destroyPorts();
        });
        const SignalWatcher signals([this](int) { end(ExitStatus::Done); });
        _client.queue.async([model = _model] { model->restartMonitor(); });
        if (_options.duration_seconds)
            _client.queue.after(std::chrono::nanoseconds(static_cast<std::int64_t>(
                                    std::llround(*_options.duration_seconds * 1e9))),
                                [this] { end(ExitStatus::Done); });
        const std::unique_ptr<Timer> saving = _client.queue.repeating(saveInterval, [this] { save(); });
        const std::unique_ptr<Timer> showing =
            _client.queue.repeating(progressInterval, [this] { tryAgain(); });
        showProgress();
        const int status = _client.loop.run();
        _model->destroyPorts();
        _progress.reset();
        return status;
    }

private:
    /// Without a decoder there is no command that would make the service send anything.
    bool learn(std::string_view technology, bool hasDecoder) {
        if (_ended)
            return false;
        if (!hasDecoder)
            return check(Failure{"the telephony service speaks " +
                                 std::string(shortTechnologyName(technology)) +
                                 ", which has no decoder here, wanted one of " + technologyNames()});
        // It may have gone and come back without anybody looking.
        if (std::exchange(_streaming, false))
            tellThatTheServiceIsGone();
        if (!check(_session.learnTechnology(technology)))
            return false;
        if (std::exchange(_gone, false))
            tell(std::string(serviceTitle) + " is back");
        _streaming = true;
        return true;
    }

    void take(const Data& message) {
        if (_ended)
            return;
        if (check(_session.append(_client.clock.now(), message.bytes())) && _options.count &&
            _session.messages() >= *_options.count)
            end(ExitStatus::Done);
    }

    void save() {
        if (_ended)
            return;
        lookAfterService();
        if (_session.hasLostReader())
            end(ExitStatus::Done);
        else if (_session.trouble().empty())
            static_cast<void>(check(_session.save()));
    }

    void tryAgain() {
        if (!_ended && !_session.trouble().empty())
            static_cast<void>(check(_session.save()));
        if (!_ended)
            showProgress();
    }

    void lookAfterService() {
        // The model looks for itself, but at the pace of its redraws.
        _model->refresh();
        if (_streaming && !_model->isConnected()) {
            _streaming = false;
            tellThatTheServiceIsGone();
        }
    }

    void tellThatTheServiceIsGone() {
        _gone = true;
        tell(std::string(serviceTitle) + " is gone; waiting for it");
    }

    /// Ends the recording on a failure, which the user is told of. Whether there was none.
    bool check(const Result<Done>& result) {
        if (result) {
            tellTrouble();
            return true;
        }
        if (_session.hasLostReader()) {
            end(ExitStatus::Done);
            return false;
        }
        tell(result.reason());
        end(ExitStatus::BadInput);
        return false;
    }

    /// Each change once: trouble that has come up, messages that find no room, trouble that has passed.
    void tellTrouble() {
        const bool trouble = !_session.trouble().empty();
        if (trouble && !_toldTrouble)
            tell(_session.trouble() + "; recording goes on when it can be, until then up to " + queueSize() +
                 " of messages wait");
        if (_session.isDropping() && !_toldDropping)
            tell(queueSize() + " of messages wait for " + _options.file + "; further ones are dropped");
        if (!trouble && _toldTrouble) {
            const std::uint64_t dropped = _session.dropped() - _droppedBefore;
            tell(_options.file + " can be written again; " + (dropped == 0 ? "no" : std::to_string(dropped)) +
                 " messages were dropped");
            _droppedBefore = _session.dropped();
        }
        _toldTrouble = trouble;
        _toldDropping = _session.isDropping();
    }

    /// What the user must know even with no eye on the terminal.
    void tell(const std::string& text) {
        if (_progress)
            _progress->clear();
        report(text);
        logLine(LogPriority::Error, text);
    }

    void end(int status) {
        if (std::exchange(_ended, true))
            return;
        _client.loop.quit(status);
    }

    void showProgress() {
        if (!_progress)
            return;
        const auto elapsed = std::chrono::floor<std::chrono::seconds>(_client.clock.now() - _started);
        std::string text = std::to_string(_session.messages()) + " messages, " +
                           std::to_string(_session.bytes()) + " bytes, " + std::to_string(elapsed.count()) +
                           " s";
        if (!_model->isConnected())
            text += std::string("; waiting for ") + serviceTitle;
        if (!_session.trouble().empty())
            text += "; " + std::to_string(_session.unsaved().messages) + " wait to be written";
        _progress->show(text);
    }

    const RecordOptions& _options;
    RecordingSession& _session;
    ServiceClient& _client;
    Time _started;
    std::shared_ptr<RecordingModel> _model;
    std::unique_ptr<ProgressLine> _progress;
    bool _streaming = false; ///< the service has been told to
    bool _gone = false;      ///< the user knows
    bool _toldTrouble = false;
    bool _toldDropping = false;
    std::uint64_t _droppedBefore = 0;
    bool _ended = false;
};

/// Tells what has been recorded, and what has not. The exit status.
int sumUp(const RecordingSession& recording, const std::string& file, int status) {
    const recordingBlocks::PacketCount unsaved = recording.unsaved();
    report("recorded " + std::to_string(recording.messages() - unsaved.messages) + " messages of " +
           recording.technology() + ", " + std::to_string(recording.bytes() - unsaved.bytes) + " bytes");
    const std::uint64_t missing = unsaved.messages + recording.dropped();
    // Messages that a pipe's reader did not wait for are none that it misses.
    if (missing == 0 || recording.hasLostReader())
        return status;
    report(std::to_string(missing) + " messages are missing from " + file);
    return ExitStatus::BadInput;
}

} // namespace

int runRecord(const RecordOptions& options) {
    const RecordingSession* opened = nullptr;
    const WorkContext context(options.file, [&opened] {
        if (opened)
            opened->removeIfEmpty();
    });
    const Result<std::unique_ptr<RecordingSession>> session =
        RecordingSession::open(options.file, options.force);
    if (!session) {
        report(session.reason());
        return ExitStatus::BadInput;
    }
    RecordingSession& recording = **session;
    opened = &recording;
    ServiceClient client;
    int status = Recorder(options, recording, client).run();
    if (const Result<Done> closed = recording.close();
        !closed && status == ExitStatus::Done && !recording.hasLostReader()) {
        report(closed.reason());
        status = ExitStatus::BadInput;
    }
    if (recording.technology().empty()) {
        if (status == ExitStatus::Done)
            report("nothing was recorded: the telephony service has named no technology");
        return ExitStatus::BadInput;
    }
    return sumUp(recording, options.file, status);
}

} // namespace velmora
