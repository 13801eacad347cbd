// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/LinuxMessagePorts.h"

#include "Platform/Linux/Ports/LinuxLocalPort.h"
#include "Platform/Linux/Ports/LinuxRemotePort.h"
#include "Platform/SystemLog.h"

#include <utility>

namespace velmora {

namespace {

/// Returned for a port whose name is taken: it is invalid from the start, gets no message, and does not
/// affect the name's owner.
class TakenLocalPort final : public LocalPort {
public:
    explicit TakenLocalPort(std::string name) : _name(std::move(name)) {}
    [[nodiscard]] const std::string& name() const override { return _name; }
    [[nodiscard]] bool isValid() const override { return false; }
    void attachToMainQueue() override {}
    void setInvalidationCallback(std::function<void(LocalPort&)>) override {}
    void invalidate() override {}

private:
    std::string _name;
};

} // namespace

LinuxMessagePorts::LinuxMessagePorts(PortOptions options)
    : _options(std::move(options)), _peers(std::make_shared<PortPeers>(_options.frameMemory)) {}

void LinuxMessagePorts::fail(const std::string& name, const std::string& reason) {
    _failure = reason;
    _peers->log().format(LogPriority::Error, "ports that failed", "Message port %s: %s", name.c_str(),
                         reason.c_str());
}

MessagePorts::Created LinuxMessagePorts::createLocal(const std::string& name, MessageCallback callback) {
    _failure.clear();
    auto port = LinuxLocalPort::create(name, std::move(callback), _options, _peers);
    if (!port) {
        fail(name, port.reason());
        return {};
    }
    if (!*port)
        return {std::make_shared<TakenLocalPort>(name), true};
    return {*std::move(port), false};
}

std::shared_ptr<RemotePort> LinuxMessagePorts::createRemote(const std::string& name) {
    _failure.clear();
    auto port = LinuxRemotePort::connect(name, _options, _peers);
    if (port)
        return *std::move(port);
    fail(name, port.reason());
    return nullptr;
}

} // namespace velmora
