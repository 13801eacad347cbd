// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/TelephonyService.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// A telephony service that answers what the test has set. Connections may outlive it.
class FakeTelephonyService final : public TelephonyService {
public:
    /// Whether the service is there to be connected to.
    bool available = true;
    /// What the log channel's creation ends with.
    VoxError error;
    /// The remote port's name that it then returns.
    std::string remotePortName = "com.velmora.test.channel";

    [[nodiscard]] std::shared_ptr<VoxServerConnection>
    _VoxServerConnectionCreate(std::function<void()> callback) override {
        ++_connectionsAsked;
        if (!available)
            return nullptr;
        _callback = std::move(callback);
        return std::make_shared<Connection>(_liveConnections);
    }

    [[nodiscard]] VoxError
    _VoxServerConnectionNetworkMonitorCreateLogChannel(VoxServerConnection&, const std::string& localPortName,
                                                       std::string& remotePort) override {
        _localPortNames.push_back(localPortName);
        remotePort = remotePortName;
        return error;
    }

    /// Calls the callback of the latest connection, whether or not the connection is still held: what is
    /// under test must bear a call that was on its way when the connection ended. Nothing without a
    /// connection.
    void callBack() const {
        if (const auto callback = _callback)
            callback();
    }

    /// Connections that are held.
    [[nodiscard]] int liveConnections() const { return *_liveConnections; }
    /// How often a connection was asked for, in vain or not.
    [[nodiscard]] int connectionsAsked() const { return _connectionsAsked; }
    /// The local ports' names that log channels were asked for, first asked first.
    [[nodiscard]] const std::vector<std::string>& localPortNames() const { return _localPortNames; }

private:
    class Connection final : public VoxServerConnection {
    public:
        explicit Connection(std::shared_ptr<int> live) : _live(std::move(live)) { ++*_live; }
        ~Connection() override { --*_live; }
        Connection(const Connection&) = delete;
        Connection& operator=(const Connection&) = delete;

    private:
        std::shared_ptr<int> _live;
    };

    std::function<void()> _callback;
    std::shared_ptr<int> _liveConnections = std::make_shared<int>(0);
    int _connectionsAsked = 0;
    std::vector<std::string> _localPortNames;
};

} // namespace velmora
