// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Log/ServiceLog.h"
#include "Tools/Record/RecordingModel.h"
#include "Tools/ServiceClient.h"

#include <functional>
#include <memory>
#include <string>
#include <string_view>

namespace velmora {

/// A command's connection to the telephony service, which it keeps through services that end and come back:
/// what the service sends, and what there is to say of the connection. Main thread only.
class ServiceLink {
public:
    /// All have to be set; none is called after `end`.
    struct Events {
        /// The service has named its technology. Returns whether to start streaming: without a decoder there
        /// is no start command to send.
        std::function<bool(std::string_view technology, bool hasDecoder)> technology;
        std::function<void(const Data& message)> message;
        std::function<void()> sourceEnded;
        /// The service is gone, and is back; `text` says so.
        std::function<void(const std::string&text)> gone, back;
        /// Why there is no connection, as long as there has never been one. Afterwards a lost service is
        /// gone, whatever the reason.
        std::function<void(const std::string& text)> problem;
    };

    /// `client` and `lines` must outlive it.
    ServiceLink(ServiceClient& client, DecoderLines& lines, Events events);

    /// Connects, once the event loop runs.
    void start();
    /// To be called several times a second.
    void check();
    /// Nothing is reported any more.
    void end() { _ended = true; }
    /// To be called when the event loop has ended.
    void close() { _model->destroyPorts(); }

    [[nodiscard]] bool isConnected() const { return _model->isConnected(); }
    /// The current problem with the connection; empty for none.
    [[nodiscard]] const std::string& problem() const { return _log.problem(); }

private:
    bool learn(std::string_view technology, bool hasDecoder);
    void lose();

    ServiceClient& _client;
    Events _events;
    ServiceLog _log;
    std::shared_ptr<RecordingModel> _model;
    bool _streaming = false;   ///< the start command has been sent
    bool _hasStreamed = false; ///< at any time so far
    bool _gone = false;        ///< the service is gone, and that has been reported
    bool _ended = false;
};

} // namespace velmora
