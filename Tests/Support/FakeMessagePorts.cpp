// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Support/FakeMessagePorts.h"

#include <map>
#include <utility>

namespace velmora {

struct FakeMessagePorts::Registry {
    std::map<std::string, FakeLocalPort*> owners;
    std::map<std::string, Handler> handlers;
    std::vector<std::weak_ptr<FakeRemotePort>> remotePorts;
    std::vector<Sent> sent;
    std::optional<std::string> nextLocalFailure;
};

class FakeMessagePorts::FakeLocalPort final : public LocalPort,
                                              public std::enable_shared_from_this<FakeLocalPort> {
public:
    FakeLocalPort(std::shared_ptr<Registry> registry, std::string name, MessageCallback callback)
        : _registry(std::move(registry)), _name(std::move(name)),
          _messageCallback(std::make_shared<MessageCallback>(std::move(callback))) {}
    ~FakeLocalPort() override { releaseName(); }
    FakeLocalPort(const FakeLocalPort&) = delete;
    FakeLocalPort& operator=(const FakeLocalPort&) = delete;

    [[nodiscard]] const std::string& name() const override { return _name; }
    [[nodiscard]] bool isValid() const override { return _valid; }
    void attachToMainQueue() override { _attached = true; }
    void setInvalidationCallback(std::function<void(LocalPort&)> callback) override {
        _invalidationCallback = std::move(callback);
    }

    void invalidate() override {
        if (!_valid)
            return;
        const auto self = shared_from_this();
        _valid = false;
        releaseName();
        _messageCallback.reset();
        if (const auto callback = std::exchange(_invalidationCallback, nullptr))
            callback(*self);
    }

    /// False, and no name to release, where another port owns it.
    bool takeName() { return _registry->owners.emplace(_name, this).second; }

    bool deliver(std::int32_t messageId, const Data& payload, std::optional<Data>* reply) {
        if (!_attached)
            return false;
        // The callback may invalidate the port or drop the last reference to it.
        const auto self = shared_from_this();
        const auto callback = _messageCallback;
        std::optional<Data> answer = (*callback)(*self, messageId, payload);
        if (reply)
            *reply = std::move(answer);
        return true;
    }

private:
    void releaseName() {
        const auto owner = _registry->owners.find(_name);
        if (owner != _registry->owners.end() && owner->second == this)
            _registry->owners.erase(owner);
    }

    std::shared_ptr<Registry> _registry;
    std::string _name;
    std::shared_ptr<MessageCallback> _messageCallback;
    std::function<void(LocalPort&)> _invalidationCallback;
    bool _valid = true;
    bool _attached = false;
};

class FakeMessagePorts::FakeRemotePort final : public RemotePort,
                                               public std::enable_shared_from_this<FakeRemotePort> {
public:
    FakeRemotePort(std::shared_ptr<Registry> registry, std::string name, Handler handler)
        : _registry(std::move(registry)), _name(std::move(name)), _handler(std::move(handler)) {}

    [[nodiscard]] const std::string& name() const override { return _name; }
    [[nodiscard]] bool isValid() const override { return _valid; }
    void setInvalidationCallback(std::function<void(RemotePort&)> callback) override {
        _invalidationCallback = std::move(callback);
    }

    void invalidate() override {
        if (!_valid)
            return;
        const auto self = shared_from_this();
        _valid = false;
        if (const auto callback = std::exchange(_invalidationCallback, nullptr))
            callback(*self);
    }

    Answer sendRequest(std::int32_t messageId, const Data& payload, std::chrono::nanoseconds sendTimeout,
                       std::chrono::nanoseconds receiveTimeout, bool wantsReply) override {
        if (!_valid)
            return {PortStatus::Invalid, std::nullopt};
        const auto self = shared_from_this();
        _registry->sent.push_back({_name, messageId, payload, sendTimeout, receiveTimeout, wantsReply});
        const auto served = _registry->handlers.find(_name);
        const Handler handler = served != _registry->handlers.end() ? served->second : _handler;
        Answer answer = handler(messageId, payload, wantsReply);
        if (!wantsReply)
            answer.reply.reset();
        return answer;
    }

    void post(std::int32_t messageId, const Data& payload) override {
        static_cast<void>(sendRequest(messageId, payload, {}, {}, false));
    }

    [[nodiscard]] std::uint64_t droppedMessages() const override { return 0; }

private:
    std::shared_ptr<Registry> _registry;
    std::string _name;
    Handler _handler;
    std::function<void(RemotePort&)> _invalidationCallback;
    bool _valid = true;
};

FakeMessagePorts::FakeMessagePorts() : _registry(std::make_shared<Registry>()) {}

FakeMessagePorts::~FakeMessagePorts() = default;

MessagePorts::Created FakeMessagePorts::createLocal(const std::string& name, MessageCallback callback) {
    _failure.clear();
    if (const auto reason = std::exchange(_registry->nextLocalFailure, std::nullopt)) {
        _failure = *reason;
        return {};
    }
    auto port = std::make_shared<FakeLocalPort>(_registry, name, std::move(callback));
    const bool taken = port->takeName();
    return {std::move(port), !taken};
}

std::shared_ptr<RemotePort> FakeMessagePorts::createRemote(const std::string& name) {
    _failure.clear();
    const auto handler = _registry->handlers.find(name);
    if (handler == _registry->handlers.end())
        return nullptr;
    auto port = std::make_shared<FakeRemotePort>(_registry, name, handler->second);
    std::erase_if(_registry->remotePorts, [](const auto& other) { return other.expired(); });
    _registry->remotePorts.push_back(port);
    return port;
}

void FakeMessagePorts::failNextLocal(std::string reason) {
    _registry->nextLocalFailure = std::move(reason);
}

bool FakeMessagePorts::isTaken(const std::string& name) const {
    return _registry->owners.contains(name);
}

bool FakeMessagePorts::deliver(const std::string& name, std::int32_t messageId, const Data& payload,
                               std::optional<Data>* reply) {
    const auto owner = _registry->owners.find(name);
    return owner != _registry->owners.end() && owner->second->deliver(messageId, payload, reply);
}

bool FakeMessagePorts::closeLocal(const std::string& name) {
    const auto owner = _registry->owners.find(name);
    if (owner == _registry->owners.end())
        return false;
    owner->second->invalidate();
    return true;
}

void FakeMessagePorts::serve(const std::string& name, Handler handler) {
    _registry->handlers[name] = std::move(handler);
}

void FakeMessagePorts::stopServing(const std::string& name) {
    _registry->handlers.erase(name);
}

void FakeMessagePorts::sever(const std::string& name) {
    // A port's callback may make other ports of the name; those are not cut.
    const auto registry = _registry;
    const auto ports = registry->remotePorts;
    for (const auto& weakPort : ports)
        if (const auto port = weakPort.lock(); port && port->name() == name)
            port->invalidate();
}

std::size_t FakeMessagePorts::connectionCount(const std::string& name) const {
    std::size_t count = 0;
    for (const auto& weakPort : _registry->remotePorts)
        if (const auto port = weakPort.lock(); port && port->name() == name && port->isValid())
            ++count;
    return count;
}

const std::vector<FakeMessagePorts::Sent>& FakeMessagePorts::sent() const {
    return _registry->sent;
}

void FakeMessagePorts::clearSent() {
    _registry->sent.clear();
}

} // namespace velmora
