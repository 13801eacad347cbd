#include "Tools/RecordCommand.h"

#include "Platform/Linux/SignalWatcher.h"
#include "Platform/TelephonyService.h"
#include "Tools/ExitStatus.h"
#include "Tools/LogSubstitute.h"
#include "Tools/RecordingSession.h"
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

/// How long a message may wait before it is in the file, and how often the progress is shown.
constexpr auto flushInterval = 1s;

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
        const WorkContext context(serviceTitle, [this] { _model->destroyPorts(); });
        const SignalWatcher signals([this](int) { end(ExitStatus::Done); });
        _client.queue.async([model = _model] { model->restartMonitor(); });
        if (_options.duration_seconds)
            _client.queue.after(std::chrono::nanoseconds(static_cast<std::int64_t>(
                                    std::llround(*_options.duration_seconds * 1e9))),
                                [this] { end(ExitStatus::Done); });
        const std::unique_ptr<Timer> timer = _client.queue.repeating(flushInterval, [this] { tick(); });
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
        return check(_session.learnTechnology(technology));
    }

    void take(const Data& message) {
        if (_ended)
            return;
        if (check(_session.append(_client.clock.now(), message.bytes())) && _options.count &&
            _session.messages() >= *_options.count)
            end(ExitStatus::Done);
    }

    void tick() {
        if (_ended)
            return;
        if (_session.hasLostReader())
            end(ExitStatus::Done);
        else if (check(_session.flush()))
            showProgress();
    }

    /// Ends the recording on a failure, which the user is told of. Whether there was none.
    bool check(const Result<Done>& result) {
        if (result)
            return true;
        if (_session.hasLostReader()) {
            end(ExitStatus::Done);
            return false;
        }
        if (_progress)
            _progress->clear();
        report(result.reason());
        end(ExitStatus::BadInput);
        return false;
    }

    void end(int status) {
        if (std::exchange(_ended, true))
            return;
        _client.loop.quit(status);
    }

    void showProgress() {
        if (!_progress)
            return;
        if (!_model->isConnected()) {
            _progress->show("waiting for the telephony service");
            return;
        }
        const auto elapsed = std::chrono::floor<std::chrono::seconds>(_client.clock.now() - _started);
        _progress->show(std::to_string(_session.messages()) + " messages, " +
                        std::to_string(_session.bytes()) + " bytes, " + std::to_string(elapsed.count()) +
                        " s");
    }

    const RecordOptions& _options;
    RecordingSession& _session;
    ServiceClient& _client;
    Time _started;
    std::shared_ptr<RecordingModel> _model;
    std::unique_ptr<ProgressLine> _progress;
    bool _ended = false;
};

} // namespace

int runRecord(const RecordOptions& options) {
    const Result<std::unique_ptr<RecordingSession>> session =
        RecordingSession::open(options.file, options.force);
    if (!session) {
        report(session.reason());
        return ExitStatus::BadInput;
    }
    RecordingSession& recording = **session;
    ServiceClient client;
    int status = Recorder(options, recording, client).run();
    if (const Result<Done> closed = recording.close();
        !closed && status == ExitStatus::Done && !recording.hasLostReader()) {
        report(closed.reason());
        status = ExitStatus::BadInput;
    }
    if (!recording.technology().empty()) {
        report("recorded " + std::to_string(recording.messages()) + " messages of " + recording.technology() +
               ", " + std::to_string(recording.bytes()) + " bytes");
        return status;
    }
    if (status == ExitStatus::Done)
        report("nothing was recorded: the telephony service has named no technology");
    return ExitStatus::BadInput;
}

} // namespace velmora
