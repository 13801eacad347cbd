// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"

#include <sys/socket.h>
#include <sys/un.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstddef>
#include <string>
#include <system_error>
#include <utility>
#include <vector>

namespace velmora {

/// The socket on which a service manager receives its services' notifications.
class NotifySocket {
public:
    /// `address` is a path, or "@" and the name of an abstract socket. Throws std::system_error.
    explicit NotifySocket(std::string address)
        : _address(std::move(address)),
          _socket(::socket(AF_UNIX, SOCK_DGRAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0)) {
        sockaddr_un name = {};
        name.sun_family = AF_UNIX;
        std::copy_n(_address.begin(), std::min(_address.size(), sizeof name.sun_path - 1), name.sun_path);
        if (_address.front() == '@')
            name.sun_path[0] = '\0';
        const auto size = static_cast<socklen_t>(offsetof(sockaddr_un, sun_path) + _address.size());
        if (::bind(_socket.get(), reinterpret_cast<const sockaddr*>(&name), size) != 0)
            throw std::system_error(errno, std::generic_category(), _address);
    }

    [[nodiscard]] const std::string& address() const { return _address; }

    /// The messages that have arrived, each once.
    [[nodiscard]] std::vector<std::string> take() {
        std::array<char, 4096> buffer = {};
        for (std::vector<std::string> messages;;) {
            const auto size = ::recv(_socket.get(), buffer.data(), buffer.size(), 0);
            if (size < 0)
                return messages;
            messages.emplace_back(buffer.data(), static_cast<std::size_t>(size));
        }
    }

private:
    std::string _address;
    FileDescriptor _socket;
};

} // namespace velmora
