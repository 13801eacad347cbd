// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace velmora {

/// Notifies the service manager that started this program of its state, by datagrams to the socket that
/// $NOTIFY_SOCKET names (see sd_notify). Where the variable is not set, nothing is sent. What cannot be sent
/// is an error line; the program continues.
class ServiceManager {
public:
    /// Takes the socket's name from the environment.
    ServiceManager();
    /// `address` is the absolute path of a socket, "@" and the name of an abstract one, or empty for none.
    explicit ServiceManager(std::string address);

    /// The program is ready; `status` is one line for status queries.
    void ready(std::string_view status) const;
    /// The program is about to end, as requested.
    void stopping() const;

private:
    void send(std::string_view message) const;

    std::string _address;
};

} // namespace velmora
