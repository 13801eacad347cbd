// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Model/VelmoraModel.h"

#include "Model/ServiceCommands.h"
#include "Platform/SystemLog.h"

#include <chrono>

namespace velmora {

using namespace std::chrono_literals;

namespace {

constexpr auto refreshInterval = 2s;
constexpr auto retryDelay = 5s;

using Problem = ConnectionProblem::Kind;

} // namespace

std::string logChannelPortName(std::string_view prefix) {
    return std::string(prefix) + ".BasebandStateReport.LogChannel";
}

VelmoraModel::VelmoraModel(ModelPlatform platform, ModelObserver* observer)
    : _platform(std::move(platform)), _observer(observer) {}

VelmoraModel::~VelmoraModel() {
    destroyPorts();
}

bool VelmoraModel::isConnected() const {
    return _recvPort && _sendPort;
}

bool VelmoraModel::createPorts() {
    const std::optional<std::string> name = _platform.portName();
    if (!name) {
        setProblem(Problem::Port);
        return false;
    }

    const std::weak_ptr<VelmoraModel> weakSelf = weak_from_this();
    MessagePorts::Created created = _platform.ports.createLocal(
        *name, [weakSelf](LocalPort&, std::int32_t messageId, const Data& payload) -> std::optional<Data> {
            const auto self = weakSelf.lock();
            if (self && messageId == 0)
                self->updateWithData(payload);
            else if (self)
                self->takeOtherMessage(messageId);
            return std::nullopt;
        });
    _recvPort = std::move(created.port);
    if (!_recvPort) {
        setProblem(Problem::Port, _platform.ports.failure());
        logLine(LogPriority::Error, "Could not create local message port");
        return false;
    }
    if (created.alreadyExisted) {
        // The handle is kept all the same: the caller closes it with the rest.
        setProblem(Problem::PortInUse);
        logLine(LogPriority::Error, "Local messsage port already exists");
        return false;
    }
    _recvPort->attachToMainQueue();
    _recvPort->setInvalidationCallback([weakSelf](LocalPort& port) {
        logFormat(LogPriority::Error, " ***** INVALIDATED %p *****", static_cast<void*>(&port));
        if (const auto self = weakSelf.lock()) {
            self->setProblem(Problem::Lost);
            self->restartMonitor();
        }
    });
    return openLogChannel(*name);
}

bool VelmoraModel::openLogChannel(const std::string& name) {
    const std::weak_ptr<VelmoraModel> weakSelf = weak_from_this();
    std::shared_ptr<VoxServerConnection> connection =
        _platform.telephony._VoxServerConnectionCreate([weakSelf] {
            if (const auto self = weakSelf.lock())
                self->refresh();
        });
    if (!connection) {
        const std::string reason = _platform.ports.failure();
        if (reason.empty())
            setProblem(Problem::NoService);
        else
            setProblem(Problem::Unreachable, std::string(causeOf(Problem::Unreachable)) + ": " + reason);
        logLine(LogPriority::Error, "Could not create VoxServerConnection");
        return false;
    }
    std::string remoteName;
    const VoxError error =
        _platform.telephony._VoxServerConnectionNetworkMonitorCreateLogChannel(*connection, name, remoteName);
    connection.reset(); // the channel outlives the connection that it was asked for on
    if (error.code != 0) {
        setProblem(Problem::NoChannel);
        logFormat(LogPriority::Error,
                  "_VoxServerConnectionNetworkMonitorCreateLogChannel returns error: %ld!",
                  static_cast<long>(error.code));
        return false;
    }
    if (remoteName.empty()) {
        setProblem(Problem::NoChannel);
        logLine(LogPriority::Error, "Could not create a log channel (Vox returned null port)!");
        return false;
    }
    _sendPort = _platform.ports.createRemote(remoteName);
    if (!_sendPort) {
        setProblem(Problem::ChannelGone);
        logLine(LogPriority::Error, "Could not create the remote port!");
        return false;
    }
    logFormat(LogPriority::Error, " ***** Created ports (send=%p, recv=%p)",
              static_cast<void*>(_sendPort.get()), static_cast<void*>(_recvPort.get()));
    return true;
}

void VelmoraModel::destroyPorts() {
    if (_displayUpdateTimer) {
        _displayUpdateTimer->invalidate();
        _displayUpdateTimer.reset();
    }
    // Without the callbacks, so that closing does not restart the monitor. Each field is cleared first:
    // observers during the closing see it closed.
    if (const auto port = std::exchange(_recvPort, nullptr)) {
        port->setInvalidationCallback({});
        port->invalidate();
    }
    if (const auto port = std::exchange(_sendPort, nullptr)) {
        port->setInvalidationCallback({});
        port->invalidate();
    }
}

void VelmoraModel::forget() {
    destroyPorts();
    decoderWillChange(nullptr);
    _logGenerator.reset();
    _state = Dictionary();
    _technologies = DisplayTechnology();
    _nodes.reset();
    _nodesByPath.reset();
    _updated = false;
}

void VelmoraModel::configureGenerator() {
    const std::optional<Value> technology = askTechnology(*_sendPort);
    if (!technology) {
        setProblem(Problem::NoTechnology);
        return;
    }
    // An answer that is no string equals no technology, like an unknown name.
    const std::string* name = technology->asString();
    std::unique_ptr<LogGenerator> next = name ? generatorFromTechnology(*name) : nullptr;
    decoderWillChange(next.get());
    _logGenerator = std::move(next);
    if (_logGenerator)
        _technologies.setDecoder(*name, _state);
    else
        setProblem(Problem::NoDecoder, name ? "the telephony service's technology " +
                                                  std::string(shortTechnologyName(*name)) +
                                                  " has no decoder here, wanted one of " + technologyNames()
                                            : "");
    logFormat(LogPriority::Error, "Got log generated: %p", static_cast<void*>(_logGenerator.get()));
}

std::unique_ptr<LogGenerator> VelmoraModel::generatorFromTechnology(std::string_view technology) {
    return LogGenerator::generatorFromTechnology(technology, _platform.clock);
}

void VelmoraModel::startMonitor() {
    if (_displayUpdateTimer)
        return;
    _problem = {};
    if (!createPorts()) {
        logLine(LogPriority::Error, "Could not create the ports necessary");
        retry();
        return;
    }
    configureGenerator();
    if (!_logGenerator) {
        logLine(LogPriority::Error, "No log generator technology works");
        retry();
        return;
    }
    if (!sendStartCommand(*_sendPort, _logGenerator->getStartCommand())) {
        setProblem(Problem::NotStarted);
        retry();
        return;
    }
    logLine(LogPriority::Error, "Starting the display update timer");
    const std::weak_ptr<VelmoraModel> weakSelf = weak_from_this();
    _displayUpdateTimer = _platform.queue.repeating(refreshInterval, [weakSelf] {
        if (const auto self = weakSelf.lock())
            self->refresh();
    });
    reportConnection();
}

void VelmoraModel::retry() {
    destroyPorts();
    reportConnection();
    // The task holds the model: a retry that is due keeps it alive.
    _platform.queue.after(retryDelay, [self = shared_from_this()] { self->startMonitor(); });
}

void VelmoraModel::restartMonitor() {
    destroyPorts();
    // Before the exchanges, which may block for seconds.
    reportConnection();
    startMonitor();
}

void VelmoraModel::setProblem(ConnectionProblem::Kind kind, std::string cause) {
    _problem = {kind, cause.empty() ? std::string(causeOf(kind)) : std::move(cause)};
}

void VelmoraModel::reportConnection() {
    const bool connected = isConnected();
    if (connected == _reportedConnected && _problem == _reportedProblem)
        return;
    _reportedConnected = connected;
    _reportedProblem = _problem;
    if (_observer)
        _observer->connectionChanged();
}

void VelmoraModel::updateWithData(const Data& data) {
    if (_logGenerator)
        _logGenerator->updateState(_state, data);
    _updated = true;
}

void VelmoraModel::refresh() {
    // Invalidating the local port runs its callback, which restarts the monitor. The port is held here since
    // the restart lets go of it.
    if (const auto port = _recvPort; port && _sendPort && !_sendPort->isValid())
        port->invalidate();
    if (!_updated)
        return;
    _updated = false;
    _nodes.reset();
    _nodesByPath.reset();
    _platform.queue.async([weakSelf = weak_from_this()] {
        if (const auto self = weakSelf.lock(); self && self->_observer)
            self->_observer->updateViewControllerFromModel();
    });
}

NodeRef VelmoraModel::topLevelNodes() {
    if (_nodes)
        return _nodes;
    if (!_logGenerator)
        return nullptr;
    const Value display = _logGenerator->generateLogUsingState(_state);
    PathDictionary paths;
    _nodes = VelmoraModelNode::makeTreeFromObject(display, paths);
    _nodesByPath = std::move(paths);
    return _nodes;
}

NodeRef VelmoraModel::nodeAtPath(const std::string& path) {
    if (!_nodesByPath)
        static_cast<void>(topLevelNodes());
    if (!_nodesByPath)
        return nullptr;
    const auto found = _nodesByPath->find(path);
    return found == _nodesByPath->end() ? nullptr : found->second;
}

ArrayRef VelmoraModel::getSaveContents() const {
    return _logGenerator ? _logGenerator->getSaveContentsFromState(_state) : nullptr;
}

} // namespace velmora
