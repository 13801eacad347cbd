// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "Model/ConnectionProblem.h"
#include "Model/DisplayTechnology.h"
#include "Model/VelmoraModelNode.h"
#include "Platform/Clock.h"
#include "Platform/MainQueue.h"
#include "Platform/MessagePort.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/Value.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// The application object as the model knows it: it is notified to redraw.
class ModelObserver {
public:
    virtual ~ModelObserver() = default;
    /// Runs on the main queue after new data; pulls the tree with topLevelNodes and nodeAtPath.
    virtual void updateViewControllerFromModel() = 0;
    /// The connection or its problem has changed, which isConnected and problem show by now. Runs within the
    /// change and may not destroy the model; what the model does next may block for seconds.
    virtual void connectionChanged() {}
};

/// The platform that the model needs. All of it must outlive the model.
struct ModelPlatform {
    MessagePorts& ports;
    MainQueue& queue;
    TelephonyService& telephony;
    const Clock& clock;
    /// Builds the local port's name, afresh on every connection; absent when it cannot.
    std::function<std::optional<std::string>()> portName;
};

/// The local port's name under a reverse-DNS prefix: "com.velmora" gives the application's.
[[nodiscard]] std::string logChannelPortName(std::string_view prefix = "com.velmora");

/// The one object that talks to the telephony service: it opens the log channel, selects a decoder for the
/// technology that the service names, starts it, passes every log message to it, and has the screens redrawn
/// every 2 seconds if anything arrived. It owns the display tree made of the decoder's output. Every failure
/// in the start sequence closes the ports and is retried 5 seconds later, without limit; a channel that is
/// lost restarts.
///
/// Held by shared_ptr, since a retry that is due keeps the model alive. Main thread only.
class VelmoraModel : public std::enable_shared_from_this<VelmoraModel> {
public:
    /// Opens nothing yet. `observer` may be null; it must outlive the model.
    VelmoraModel(ModelPlatform platform, ModelObserver* observer);
    virtual ~VelmoraModel();
    VelmoraModel(const VelmoraModel&) = delete;
    VelmoraModel& operator=(const VelmoraModel&) = delete;

    /// Whether both ports are open.
    [[nodiscard]] bool isConnected() const;
    /// Why the latest attempt to connect failed. A connected model may have one too: the service does not
    /// name its technology, and the decoder of the earlier connection goes on.
    [[nodiscard]] const ConnectionProblem& problem() const { return _problem; }
    /// The service's constant of the technology that the decoder is for; empty before there is one.
    [[nodiscard]] const std::string& technology() const { return _technologies.ofDecoder(); }
    /// The technology whose display the tree shows: an earlier one than technology() after a change to one
    /// that writes into the display that is there. Empty where there is no display.
    [[nodiscard]] std::string displayTechnology() const { return _technologies.ofDisplay(_state); }

    /// Opens the local port and the log channel. After a failure the local port may be open: the caller
    /// closes the ports.
    [[nodiscard]] bool createPorts();
    /// Stops the timer and closes both ports, without a restart. Decoder, state and tree stay.
    void destroyPorts();
    /// The "GetTechnology" exchange. The decoder changes only when the answer names a technology (to none
    /// where no decoder knows it); after any other outcome the decoder of an earlier connection is kept.
    void configureGenerator();
    /// The complete start sequence with its retry; nothing while monitoring is running.
    void startMonitor();
    void restartMonitor();

    /// Closes the ports and forgets all that was decoded: decoder, state and tree. `restartMonitor` begins
    /// as if there had been no connection.
    void forget();

    /// Passes one log message to the decoder.
    virtual void updateWithData(const Data& data);

    /// A message of another id than log messages have; ignored.
    virtual void takeOtherMessage(std::int32_t /*messageId*/) {}

    /// The timer's action: notices a dead service, and has the screens redrawn if anything arrived.
    void refresh();

    /// The tree's root, built on demand and kept until new data; null without a decoder. Building has the
    /// decoder append to its history, so it is done at most once a refresh.
    [[nodiscard]] NodeRef topLevelNodes();
    /// The node recorded under exactly this path, or null.
    [[nodiscard]] NodeRef nodeAtPath(const std::string& path);

    /// What a snapshot saves; null without a decoder.
    [[nodiscard]] ArrayRef getSaveContents() const;

    [[nodiscard]] const LogGenerator* logGenerator() const { return _logGenerator.get(); }
    [[nodiscard]] const Dictionary& state() const { return _state; }

protected:
    /// Picks the decoder for the technology that the service named.
    [[nodiscard]] virtual std::unique_ptr<LogGenerator> generatorFromTechnology(std::string_view technology);
    /// The decoder is about to be replaced by that one, or removed (null); the earlier one still exists. The
    /// default does nothing.
    virtual void decoderWillChange(LogGenerator* /*next*/) {}

private:
    [[nodiscard]] bool openLogChannel(const std::string& name);
    void setProblem(ConnectionProblem::Kind kind, std::string cause = {});
    /// Has the observer notice what differs from the last time.
    void reportConnection();
    void retry();

    ModelPlatform _platform;
    ModelObserver* _observer;

    std::shared_ptr<LocalPort> _recvPort;
    std::shared_ptr<RemotePort> _sendPort;
    /// Non-null exactly while monitoring is running.
    std::unique_ptr<Timer> _displayUpdateTimer;
    /// Set by every log message, cleared by `refresh`.
    bool _updated = false;
    std::unique_ptr<LogGenerator> _logGenerator;
    ConnectionProblem _problem;
    /// What the observer knows.
    bool _reportedConnected = false;
    ConnectionProblem _reportedProblem;
    DisplayTechnology _technologies;
    /// Created once and emptied by `forget` alone: it survives reconnection and a change of decoder, so that
    /// a new decoder starts with what the earlier one left in it. That is intended.
    Dictionary _state;
    /// The cached tree and its paths: set together, dropped together.
    NodeRef _nodes;
    std::optional<PathDictionary> _nodesByPath;
};

} // namespace velmora
