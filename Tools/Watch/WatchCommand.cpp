// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Watch/WatchCommand.h"

#include "Platform/DateText.h"
#include "Platform/Linux/Files/LargeAllocations.h"
#include "Platform/Linux/SignalWatcher.h"
#include "Platform/TelephonyService.h"
#include "Tools/ExitStatus.h"
#include "Tools/Log/DecoderLog.h"
#include "Tools/Log/ServiceLog.h"
#include "Tools/Output.h"
#include "Tools/Report.h"
#include "Tools/Rules/RuleFiles.h"
#include "Tools/ServiceClient.h"
#include "Tools/Watch/WatchEvents.h"
#include "Tools/Watch/WatchModel.h"
#include "Tools/Watch/WatchView.h"

#include <chrono>
#include <cmath>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

namespace velmora {

namespace {

using namespace std::chrono_literals;

/// How often the connection and the pipe are checked between refreshes.
constexpr auto statusInterval = 250ms;
constexpr const char* connecting = "Connecting...";

/// The model's observer: passes each refresh to the view, and keeps the status line up to date in between.
class Watcher final : public ModelObserver {
public:
    /// `mask` may be null, for messages as they are.
    Watcher(const WatchOptions& options, DecoderLines& lines, Output& output, ServiceClient& client,
            MessageMask* mask)
        : _client(client), _lines(lines), _options(options), _mask(mask), _model(newModel()) {
        if (!_options.once && Terminal::isThere()) {
            watchEvents();
            _view = std::make_unique<ScreenView>([this] { _client.loop.quit(ExitStatus::Done); });
        } else {
            _view = std::make_unique<PipeView>(output);
        }
        // Over the view's own, which holds what is written.
        _log.emplace(lines);
    }

    /// Until the user, a signal or a closed pipe ends it.
    int run() {
        const WorkContext context(serviceTitle, [this] {
            _model->destroyPorts();
            _view->restoreTerminal();
        });
        const SignalWatcher signals([this](int) { _client.loop.quit(ExitStatus::Done); });
        _client.queue.async([this] { _model->restartMonitor(); });
        // The first check comes after the first attempt to connect.
        _client.queue.async([this] { checkStatus(); });
        if (_options.timeout_seconds)
            _client.queue.after(std::chrono::nanoseconds(
                                    static_cast<std::int64_t>(std::llround(*_options.timeout_seconds * 1e9))),
                                [this] { giveUp(); });
        _statusTimer = _client.queue.repeating(statusInterval, [this] { checkStatus(); });
        const int status = _client.loop.run();
        _statusTimer.reset();
        _model->destroyPorts();
        return status;
    }

    void updateViewControllerFromModel() override {
        const NodeRef root = displayNodes();
        showProblem();
        if (_shownProblem.cause.empty())
            _view->showNote({}, {}); // of a change of technology
        if (_model->isConnected())
            _updateMessage = "Updated " + localDateAndTime(_client.clock, _client.clock.now(), " at ");
        _shownStatus = status();
        _view->showRefresh(_shownStatus, root ? treeRows(*root) : std::vector<TreeRow>());
        _hasRefresh = true;
        if (_options.once || !_view->isOpen())
            _client.loop.quit(ExitStatus::Done);
    }

    void connectionChanged() override {
        showProblem();
        if (_events && !_model->isConnected()) {
            const DecoderLog log(_lines);
            _events->interrupt();
        }
    }

private:
    [[nodiscard]] std::shared_ptr<VelmoraModel> newModel() {
        WatchModel::Events events;
        events.changed = [this](std::string_view technology) {
            _view->showNote("the technology is " + std::string(shortTechnologyName(technology)) + " now", {});
            _client.queue.async([this] { beginAnew(); });
        };
        events.technology = [this](std::string_view technology) {
            if (_events)
                _events->setTechnology(technology);
        };
        events.message = [this](const Data& message) {
            if (_events)
                _events->take(message);
        };
        return std::make_shared<WatchModel>(_client.platform(), this, _lines, std::move(events), _mask);
    }

    /// Shows the latest events, for which the messages are decoded once more.
    void watchEvents() {
        const DecoderLog log(_lines);
        _catalogues.emplace();
        // Mistakes in the user's rules are reported by `events`; the screen has no room for them.
        _rules.emplace(loadRules(*_catalogues, {}));
        _events.emplace(*_rules, _client.clock, [this](const Event& event, bool isNew) {
            _view->showEvents(_events->line(), isNew && _options.bell && event.severity >= *_options.bell);
        });
    }

    /// Once for each change of it.
    void showProblem() {
        if (_shownProblem == _model->problem())
            return;
        _shownProblem = _model->problem();
        _view->showNote(_shownProblem.cause, adviceAgainst(_shownProblem));
    }

    /// There has been time for the first refresh.
    void giveUp() {
        if (_hasRefresh)
            return;
        report(timeoutMessage(_shownProblem, *_options.timeout_seconds));
        _client.loop.quit(ExitStatus::BadInput);
    }

    [[nodiscard]] NodeRef displayNodes() {
        const DecoderLog log(_lines);
        return _model->topLevelNodes();
    }

    void beginAnew() {
        _model->destroyPorts();
        _model = newModel();
        _model->restartMonitor();
    }

    [[nodiscard]] std::string status() const { return _model->isConnected() ? _updateMessage : connecting; }

    void checkStatus() {
        if (!_view->isOpen()) {
            _client.loop.quit(ExitStatus::Done);
            return;
        }
        // Connected again, but without a refresh so far: the line stays until there is one.
        if (_options.once || _model->isConnected() || _shownStatus == connecting)
            return;
        _shownStatus = connecting;
        _view->showStatus(_shownStatus);
    }

    ServiceClient& _client;
    DecoderLines& _lines;
    const WatchOptions& _options;
    MessageMask* _mask;
    bool _hasRefresh = false;
    std::optional<AllCatalogues> _catalogues;
    std::optional<RuleSet> _rules;
    std::optional<WatchEvents> _events; ///< on a terminal alone
    std::shared_ptr<VelmoraModel> _model;
    std::unique_ptr<WatchView> _view;
    std::optional<ServiceLog> _log;
    ConnectionProblem _shownProblem;
    std::unique_ptr<Timer> _statusTimer;
    std::string _updateMessage = connecting;
    std::string _shownStatus;
};

} // namespace

int runWatch(const WatchOptions& options, DecoderLines& lines, Output& output) {
    const Result<std::optional<MaskOptions>> masking = maskOptionsOf(options.mask);
    if (!masking) {
        report(masking.reason());
        return ExitStatus::BadInput;
    }
    std::optional<MessageMask> mask;
    if (*masking)
        mask.emplace(**masking);
    returnLargeAllocations();
    ServiceClient client;
    const int status = Watcher(options, lines, output, client, mask ? &*mask : nullptr).run();
    return output.state() == Output::State::Failed ? ExitStatus::BadInput : status;
}

} // namespace velmora
