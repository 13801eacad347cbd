// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/LinuxTelephonyService.h"

#include "Platform/SystemLog.h"
#include "PropertyLists/PropertyList.h"

#include <limits>
#include <utility>

namespace velmora {

namespace {

constexpr std::int32_t commandMessageId = 0;
constexpr std::chrono::seconds timeToSend(1);
constexpr std::chrono::seconds timeToAnswer(1);

class PortServerConnection final : public VoxServerConnection {
public:
    PortServerConnection(std::shared_ptr<RemotePort> port, std::function<void()> callback)
        : _port(std::move(port)) {
        if (callback)
            _port->setInvalidationCallback([callback = std::move(callback)](RemotePort&) { callback(); });
    }
    ~PortServerConnection() override { _port->setInvalidationCallback(nullptr); }

    [[nodiscard]] RemotePort& port() { return *_port; }

private:
    std::shared_ptr<RemotePort> _port;
};

/// The service's code as the caller's smaller integer; never 0 for one that is not.
std::int32_t errorCode(std::int64_t code) {
    using Limits = std::numeric_limits<std::int32_t>;
    return code < Limits::min() || code > Limits::max() ? Limits::min() : static_cast<std::int32_t>(code);
}

} // namespace

std::shared_ptr<VoxServerConnection>
LinuxTelephonyService::_VoxServerConnectionCreate(std::function<void()> callback) {
    auto port = _ports.createRemote(std::string(vox::serverPortName));
    if (!port)
        return nullptr;
    return std::make_shared<PortServerConnection>(std::move(port), std::move(callback));
}

VoxError LinuxTelephonyService::_VoxServerConnectionNetworkMonitorCreateLogChannel(
    VoxServerConnection& connection, const std::string& localPortName, std::string& remotePortName) {
    remotePortName.clear();
    auto request = makeDictionary();
    request->set(vox::createLogChannelKey, localPortName);
    const auto text = writeXMLPropertyList(request);
    if (!text) {
        logFormat(LogPriority::Error, "Log channel request: %s", text.reason().c_str());
        return {VoxErrorDomain::Transport, PortStatus::TransportError};
    }
    RemotePort& port = static_cast<PortServerConnection&>(connection).port();
    const auto answer =
        port.sendRequest(commandMessageId, Data(std::vector<std::uint8_t>(text->begin(), text->end())),
                         timeToSend, timeToAnswer, true);
    if (answer.status != PortStatus::Success)
        return {VoxErrorDomain::Transport, answer.status};
    if (!answer.reply)
        return {};
    const auto reply = readPropertyList(answer.reply->bytes());
    if (!reply) {
        logFormat(LogPriority::Error, "Answer to the log channel request: %s", reply.reason().c_str());
        return {};
    }
    const Dictionary* fields = reply->asDictionary();
    if (!fields)
        return {};
    if (const std::int64_t* code = (*fields)[vox::errorKey].asInteger(); code && *code != 0)
        return {VoxErrorDomain::Service, errorCode(*code)};
    if (const std::string* name = (*fields)[vox::portKey].asString())
        remotePortName = *name;
    return {};
}

} // namespace velmora
