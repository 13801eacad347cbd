// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/MessagePort.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Message ports in memory. The test plays the peers: it delivers messages to the local ports that the code
/// under test makes, serves the names that it connects to, and cuts connections. Everything happens within
/// the call that asks for it. Ports may outlive the object they come from.
class FakeMessagePorts final : public MessagePorts {
public:
    /// A message that was sent on a remote port. `post` shows as a one-way message with time-outs of zero.
    struct Sent {
        std::string port;
        std::int32_t id = 0;
        Data payload;
        std::chrono::nanoseconds sendTimeout{0};
        std::chrono::nanoseconds receiveTimeout{0};
        bool wantsReply = false;
    };

    /// The peer of a served name. The sender gets its answer, except for a reply that was not requested.
    using Handler =
        std::function<RemotePort::Answer(std::int32_t messageId, const Data& payload, bool wantsReply)>;

    FakeMessagePorts();
    ~FakeMessagePorts() override;
    FakeMessagePorts(const FakeMessagePorts&) = delete;
    FakeMessagePorts& operator=(const FakeMessagePorts&) = delete;

    [[nodiscard]] Created createLocal(const std::string& name, MessageCallback callback) override;
    [[nodiscard]] std::shared_ptr<RemotePort> createRemote(const std::string& name) override;

    [[nodiscard]] std::string failure() const override { return _failure; }

    /// The next `createLocal` returns no port, for this reason.
    void failNextLocal(std::string reason = {});
    /// Whether a local port owns the name.
    [[nodiscard]] bool isTaken(const std::string& name) const;
    /// Hands the message to the local port that owns the name. False, and nothing happens, when there is none
    /// or it has not been attached. `reply`, where given, becomes what the port's callback answered.
    bool deliver(const std::string& name, std::int32_t messageId, const Data& payload,
                 std::optional<Data>* reply = nullptr);
    /// The platform closes the local port that owns the name. False when there is none.
    bool closeLocal(const std::string& name);

    /// From now on the name can be connected to, and `handler` takes what is sent there, on connections that
    /// are there already as well.
    void serve(const std::string& name, Handler handler);
    /// The name cannot be connected to any more. Connections that are there stay and keep their handler.
    void stopServing(const std::string& name);
    /// Ends the connections of all remote ports of that name. The name is served on.
    void sever(const std::string& name);
    /// Remote ports of that name that are valid.
    [[nodiscard]] std::size_t connectionCount(const std::string& name) const;

    /// Every message taken from a valid remote port, first sent first.
    [[nodiscard]] const std::vector<Sent>& sent() const;
    void clearSent();

private:
    struct Registry;
    class FakeLocalPort;
    class FakeRemotePort;

    std::shared_ptr<Registry> _registry;
    std::string _failure;
};

} // namespace velmora
