// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Service/LogServer.h"

#include "LogMessages/LogMessage.h"
#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Telephony/Service/ChannelRequest.h"

#include <algorithm>
#include <utility>

namespace velmora {
namespace {

/// A dictionary of one entry, as replies are.
Value replyOf(std::string_view key, Value value) {
    return Value(std::make_shared<Dictionary>(Dictionary{{std::string(key), std::move(value)}}));
}

std::optional<Data> serialized(const Value& reply) {
    const auto text = writeXMLPropertyList(reply);
    if (!text) {
        logFormat(LogPriority::Error, "cannot write a reply: %s", text.reason().c_str());
        return std::nullopt;
    }
    return Data(std::vector<std::uint8_t>(text->begin(), text->end()));
}

// The kinds of lines that clients can provoke.
constexpr const char* refusedRequests = "refused requests for log channels";
constexpr const char* openedChannels = "opened log channels";
constexpr const char* closedChannels = "closed log channels";
constexpr const char* startCommands = "start commands";
constexpr const char* invalidCommands = "invalid commands";

} // namespace

LogServer::LogServer(MessagePorts& ports, MainQueue& queue, LogSource& source)
    : _ports(ports), _queue(queue), _source(source) {}

LogServer::~LogServer() {
    stop();
}

Result<Done> LogServer::listen(std::function<void()> onPortLost) {
    const std::string name(vox::serverPortName);
    const auto answer = [this](LocalPort&, std::int32_t messageId,
                               const Data& payload) -> std::optional<Data> {
        if (messageId != 0)
            return std::nullopt;
        return serialized(createChannel(payload));
    };
    const MessagePorts::Created created = _ports.createLocal(name, answer);
    if (!created.port)
        return Failure{"cannot make the port " + name};
    if (created.alreadyExisted)
        return Failure{"the port " + name + " is taken, wanted to be the only telephony service"};
    _serverPort = created.port;
    _serverPort->setInvalidationCallback([lost = std::move(onPortLost)](LocalPort& port) {
        logFormat(LogPriority::Error, "the port %s was closed", port.name().c_str());
        lost();
    });
    _serverPort->closeIdleConnections();
    _serverPort->attachToMainQueue();
    _source.setTechnologyCallback([this] { technologyChanged(); });
    return Done{};
}

void LogServer::stop() {
    if (const auto port = std::exchange(_serverPort, nullptr)) {
        port->setInvalidationCallback(nullptr);
        port->invalidate();
        _source.setTechnologyCallback(nullptr);
    }
    for (const ChannelRef& channel : _channels)
        if (channel->isOpen())
            channel->close();
    removeClosedChannels();
}

Value LogServer::createChannel(const Data& request) {
    const Result<std::string> name = requestedPort(request);
    if (!name)
        return refuse(Refusal::Malformed, name.reason());
    const std::string requester = *name + " requests a log channel, but ";
    if (isServicePort(*name))
        return refuse(Refusal::ServicePort, requester + "that name is the service's own");
    removeClosedChannels();
    if (_channels.size() >= maximumChannels)
        return refuse(Refusal::TooManyChannels,
                      requester + std::to_string(_channels.size()) + " are open already");
    std::shared_ptr<RemotePort> application = _ports.createRemote(*name);
    if (!application)
        return refuse(Refusal::NoSuchPort, requester + "there is no such port");
    // A name has one owner: an open channel to that name is to an owner that has ended, or an earlier one of
    // the same owner, which would now get everything twice.
    for (const ChannelRef& channel : _channels)
        if (channel->applicationName() == *name)
            close(*channel, *name + " has gone");
    std::shared_ptr<LocalPort> commands = createChannelPort();
    if (!commands)
        return refuse(Refusal::NoChannelPort, requester + "no port can be made for it");
    const auto channel = std::make_shared<LogChannel>(_queue, commands, application);
    _channels.push_back(channel);
    const std::weak_ptr<LogChannel> weak = channel;
    application->setInvalidationCallback([this, weak](RemotePort&) {
        if (const auto gone = weak.lock())
            close(*gone, gone->applicationName() + " has gone");
    });
    commands->setInvalidationCallback([this, weak](LocalPort&) {
        if (const auto gone = weak.lock())
            close(*gone, gone->applicationName() + " has gone");
    });
    commands->attachToMainQueue();
    _log.format(LogPriority::Notice, openedChannels, "%s: opened for %s", channel->name().c_str(),
                name->c_str());
    watchIdleChannels();
    return replyOf(vox::portKey, channel->name());
}

Value LogServer::refuse(Refusal reason, const std::string& why) {
    _log.line(LogPriority::Error, refusedRequests, why);
    return replyOf(vox::errorKey, static_cast<std::int32_t>(reason));
}

std::shared_ptr<LocalPort> LogServer::createChannelPort() {
    const auto answer = [this](LocalPort& port, std::int32_t messageId, const Data& payload) {
        return messageId == 0 ? command(port.name(), payload) : std::nullopt;
    };
    // Numbers are not used again; one that is taken all the same belongs to another process.
    for (int attempt = 0; attempt < 100; ++attempt) {
        const std::string name =
            std::string(vox::serverPortName) + ".channel." + std::to_string(++_channelsMade);
        const MessagePorts::Created created = _ports.createLocal(name, answer);
        if (!created.port || !created.alreadyExisted)
            return created.port;
    }
    return nullptr;
}

void LogServer::technologyChanged() {
    const std::string why =
        "the technology is " + std::string(shortTechnologyName(_source.technology())) + " now";
    for (const ChannelRef& channel : _channels)
        close(*channel, why);
}

void LogServer::watchIdleChannels() {
    if (_watchesIdle || _channels.size() < manyChannels)
        return;
    std::vector<std::weak_ptr<LogChannel>> idle;
    for (const ChannelRef& channel : _channels)
        if (!channel->isStreaming())
            idle.push_back(channel);
    if (idle.empty())
        return;
    _watchesIdle = true;
    _queue.after(idleTimeout, [this, alive = std::weak_ptr<bool>(_alive), idle = std::move(idle)] {
        if (!alive.expired())
            closeIdle(idle);
    });
}

void LogServer::closeIdle(const std::vector<std::weak_ptr<LogChannel>>& idle) {
    _watchesIdle = false;
    removeClosedChannels();
    if (_channels.size() < manyChannels)
        return;
    for (const auto& weak : idle)
        if (const ChannelRef channel = weak.lock(); channel && !channel->isStreaming())
            close(*channel, channel->applicationName() + " has asked for nothing within 10 s");
    removeClosedChannels();
    watchIdleChannels();
}

void LogServer::close(LogChannel& channel, const std::string& why) {
    if (!channel.isOpen())
        return;
    _log.format(LogPriority::Notice, closedChannels, "%s: closed, %s", channel.name().c_str(), why.c_str());
    channel.close();
    // Deferred: messages may just now be on their way to the channels.
    _queue.async([this, weak = std::weak_ptr<bool>(_alive)] {
        if (!weak.expired())
            removeClosedChannels();
    });
}

void LogServer::removeClosedChannels() {
    std::erase_if(_channels, [](const ChannelRef& channel) { return !channel->isOpen(); });
    const bool streaming = std::any_of(_channels.begin(), _channels.end(),
                                       [](const ChannelRef& channel) { return channel->isStreaming(); });
    if (!_sourceRuns || streaming)
        return;
    _sourceRuns = false;
    _sourceEnded = false;
    _source.stop();
    _latestExtra.clear();
}

std::optional<Data> LogServer::command(const std::string& channelName, const Data& payload) {
    const auto found = std::find_if(_channels.begin(), _channels.end(), [&](const ChannelRef& channel) {
        return channel->isOpen() && channel->name() == channelName;
    });
    if (found == _channels.end())
        return std::nullopt;
    const ChannelRef channel = *found;
    const auto parsed = readPropertyList(payload.bytes());
    if (!parsed) {
        _log.format(LogPriority::Error, invalidCommands, "%s: cannot read a command: %s", channelName.c_str(),
                    parsed.reason().c_str());
        return std::nullopt;
    }
    const Dictionary* dictionary = parsed->asDictionary();
    if (dictionary && dictionary->contains(vox::getTechnologyKey)) {
        if (_source.technology().empty())
            return serialized(Value(makeDictionary())); // the client asks again later
        return serialized(replyOf(vox::getTechnologyKey, _source.technology()));
    }
    if (dictionary && dictionary->contains(vox::setStateKey)) {
        startStreaming(*channel, *dictionary);
        return std::nullopt;
    }
    _log.format(LogPriority::Error, invalidCommands, "%s: a command has neither GetTechnology nor SetState",
                channelName.c_str());
    return std::nullopt;
}

void LogServer::startStreaming(LogChannel& channel, const Dictionary& command) {
    const Value& state = command[vox::setStateKey];
    if (!state.asString() || *state.asString() != vox::streamingState) {
        const std::string found = state.asString() ? quotedForLog(*state.asString())
                                                   : "of kind " + std::string(nameOf(state.kind()));
        _log.format(LogPriority::Error, invalidCommands, "%s: SetState is %s, wanted \"Streaming\"",
                    channel.name().c_str(), found.c_str());
        return;
    }
    auto filter = LogFilter::fromStartCommand(command);
    if (!filter) {
        _log.format(LogPriority::Error, invalidCommands, "%s: %s", channel.name().c_str(),
                    filter.reason().c_str());
        return;
    }
    // A client that has ended must not keep the source running, or the new client would join in mid-run.
    removeClosedChannels();
    channel.stream(*std::move(filter));
    _log.format(LogPriority::Notice, startCommands, "%s: streaming to %s", channel.name().c_str(),
                channel.applicationName().c_str());
    if (!_sourceRuns) {
        _sourceRuns = true;
        _source.start(*this);
        return;
    }
    for (const auto& [code, message] : _latestExtra)
        channel.send(message);
    if (_sourceEnded)
        channel.sendEnd();
}

void LogServer::sourceEnded() {
    _sourceEnded = true;
    for (const ChannelRef& channel : _channels)
        channel->sendEnd();
}

void LogServer::receive(const Data& message) {
    cacheExtra(message);
    // A channel may close on the way; none is added or removed.
    for (const ChannelRef& channel : _channels)
        channel->send(message);
}

void LogServer::cacheExtra(const Data& message) {
    const auto header = LogMessage::parse(message.bytes());
    if (!header || header->type != LogMessage::extraType)
        return;
    if (_latestExtra.size() < maximumCachedExtra || _latestExtra.contains(header->code))
        _latestExtra.insert_or_assign(header->code, message);
}

bool LogServer::hasRoom() const {
    bool room = true;
    for (const ChannelRef& channel : _channels)
        room = channel->hasRoom() && room;
    return room;
}

} // namespace velmora
