// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Platform/LinuxPortFixture.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <utility>
#include <vector>

#include <sys/socket.h>

namespace velmora {

/// Reads exactly that many bytes, blocking; what there is when the connection ends before.
inline Data readBlocking(const FileDescriptor& socket, std::size_t count) {
    std::vector<std::uint8_t> bytes(count);
    const auto got = ::recv(socket.get(), bytes.data(), count, MSG_WAITALL);
    bytes.resize(got > 0 ? static_cast<std::size_t>(got) : 0);
    return Data(std::move(bytes));
}

class LinuxRemotePortFixture : public LinuxPortTest {
protected:
    LinuxRemotePortFixture() : _server(rawServer("peer")) {}

    std::shared_ptr<RemotePort> connected() {
        auto port = LinuxMessagePorts(_options).createRemote("peer");
        EXPECT_TRUE(port);
        _peer = FileDescriptor(::accept(_server.get(), nullptr, nullptr));
        return port;
    }

    FileDescriptor _server;
    FileDescriptor _peer; ///< the other end of the latest connection; blocking
};

} // namespace velmora
