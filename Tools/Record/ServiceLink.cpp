// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Record/ServiceLink.h"

#include <utility>

namespace velmora {

ServiceLink::ServiceLink(ServiceClient& client, DecoderLines& lines, Events events)
    : _client(client), _events(std::move(events)), _log(lines, [this](const std::string& problem) {
          if (!_ended && !_hasStreamed)
              _events.problem(problem + "; retrying");
      }) {
    RecordingModel::Events model;
    model.connecting = [this] {
        lose();
        // Once the attempt is over, and not half a second later: the service may be lost again by then.
        _client.queue.async([this] { check(); });
    };
    model.message = [this](const Data& message) {
        if (!_ended)
            _events.message(message);
    };
    model.sourceEnded = [this] {
        if (!_ended)
            _events.sourceEnded();
    };
    model.technology = [this](std::string_view technology, bool hasDecoder) {
        return learn(technology, hasDecoder);
    };
    _model = std::make_shared<RecordingModel>(client.platform(), std::move(model));
}

void ServiceLink::start() {
    _client.queue.async([model = _model] { model->restartMonitor(); });
}

bool ServiceLink::learn(std::string_view technology, bool hasDecoder) {
    if (_ended || !_events.technology(technology, hasDecoder))
        return false;
    // The start command follows at once. A service that is lost before the next check is lost all the same.
    _streaming = true;
    _hasStreamed = true;
    return true;
}

void ServiceLink::check() {
    if (_ended)
        return;
    // The model checks by itself, but at the pace of its redraws.
    _model->refresh();
    if (!_model->isConnected()) {
        lose();
        return;
    }
    _streaming = true;
    _hasStreamed = true;
    if (std::exchange(_gone, false))
        _events.back(std::string(serviceTitle) + " is back");
}

/// Also at each attempt to connect: the service may have ended and restarted between two checks.
void ServiceLink::lose() {
    if (_ended || !std::exchange(_streaming, false))
        return;
    _gone = true;
    _events.gone(std::string(serviceTitle) + " is gone; waiting for it");
}

} // namespace velmora
