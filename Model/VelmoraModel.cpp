// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Model/VelmoraModel.h"

#include "Platform/SystemLog.h"
#include "PropertyLists/PropertyList.h"

#include <chrono>

namespace velmora {

using namespace std::chrono_literals;

namespace {

constexpr auto refreshInterval = 2s;
constexpr auto retryDelay = 5s;
constexpr auto commandTimeout = 1s;

Result<Data> serialize(const DictionaryRef& command) {
    Result<std::string> xml = writeXMLPropertyList(command);
    if (!xml)
        return Failure{xml.reason()};
    return Data(std::vector<std::uint8_t>(xml->begin(), xml->end()));
}

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
    if (!name)
        return false;

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
        logLine(LogPriority::Error, "Could not create local message port");
        return false;
    }
    if (created.alreadyExisted) {
        // The handle is kept all the same: the caller closes it with the rest.
        logLine(LogPriority::Error, "Local messsage port already exists");
        return false;
    }
    _recvPort->attachToMainQueue();
    _recvPort->setInvalidationCallback([weakSelf](LocalPort& port) {
        logFormat(LogPriority::Error, " ***** INVALIDATED %p *****", static_cast<void*>(&port));
        if (const auto self = weakSelf.lock())
            self->restartMonitor();
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
        logLine(LogPriority::Error, "Could not create VoxServerConnection");
        return false;
    }
    std::string remoteName;
    const VoxError error =
        _platform.telephony._VoxServerConnectionNetworkMonitorCreateLogChannel(*connection, name, remoteName);
    connection.reset(); // the channel outlives the connection that it was asked for on
    if (error.code != 0) {
        logFormat(LogPriority::Error,
                  "_VoxServerConnectionNetworkMonitorCreateLogChannel returns error: %ld!",
                  static_cast<long>(error.code));
        return false;
    }
    if (remoteName.empty()) {
        logLine(LogPriority::Error, "Could not create a log channel (Vox returned null port)!");
        return false;
    }
    _sendPort = _platform.ports.createRemote(remoteName);
    if (!_sendPort) {
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

void VelmoraModel::configureGenerator() {
    const DictionaryRef request = makeDictionary();
    request->set(vox::getTechnologyKey, vox::getTechnologyKey);
    const Result<Data> data = serialize(request);
    if (!data) {
        logLine(LogPriority::Error, " Could not generate GetTechnology command; cannot configure");
        return;
    }
    const RemotePort::Answer answer = _sendPort->sendRequest(0, *data, commandTimeout, commandTimeout, true);
    if (answer.status != PortStatus::Success) {
        logFormat(LogPriority::Error, " ***** Could not send the GetTechnology command (got error=%d)",
                  answer.status);
        return;
    }
    if (!answer.reply) {
        logLine(LogPriority::Error, " ***** No response to GetTechnology; cannot configure");
        return;
    }
    const Result<Value> reply = readPropertyList(answer.reply->bytes());
    if (!reply) {
        logLine(LogPriority::Error, " ***** Could not parse reply to GetTechnology; cannot configure");
        return;
    }
    const Dictionary* answers = reply->asDictionary();
    const Value* technology = answers ? answers->find(vox::getTechnologyKey) : nullptr;
    if (!technology) {
        logLine(LogPriority::Error, " ***** Reply to GetTechnology had no answer; cannot configure");
        return;
    }
    // An answer that is no string equals no technology, like an unknown name.
    const std::string* name = technology->asString();
    _logGenerator = name ? generatorFromTechnology(*name) : nullptr;
    logFormat(LogPriority::Error, "Got log generated: %p", static_cast<void*>(_logGenerator.get()));
}

std::unique_ptr<LogGenerator> VelmoraModel::generatorFromTechnology(std::string_view technology) {
    return LogGenerator::generatorFromTechnology(technology, _platform.clock);
}

void VelmoraModel::startMonitor() {
    if (_displayUpdateTimer)
        return;
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
    if (!sendStartCommand()) {
        retry();
        return;
    }
    logLine(LogPriority::Error, "Starting the display update timer");
    const std::weak_ptr<VelmoraModel> weakSelf = weak_from_this();
    _displayUpdateTimer = _platform.queue.repeating(refreshInterval, [weakSelf] {
        if (const auto self = weakSelf.lock())
            self->refresh();
    });
}

bool VelmoraModel::sendStartCommand() {
    const Result<Data> command = serialize(_logGenerator->getStartCommand());
    if (!command) {
        logLine(LogPriority::Error, " Could not generate PLIST");
        return false;
    }
    const RemotePort::Answer answer = _sendPort->sendRequest(0, *command, commandTimeout, 0s, false);
    if (answer.status != PortStatus::Success) {
        logFormat(LogPriority::Error, " ***** Could not send the START command (got error=%d)",
                  answer.status);
        return false;
    }
    return true;
}

void VelmoraModel::retry() {
    destroyPorts();
    // The task holds the model: a retry that is due keeps it alive.
    _platform.queue.after(retryDelay, [self = shared_from_this()] { self->startMonitor(); });
}

void VelmoraModel::restartMonitor() {
    destroyPorts();
    startMonitor();
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
