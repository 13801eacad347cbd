// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/ServiceManager.h"

#include "Platform/Linux/Errno.h"
#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/SystemLog.h"

#include <sys/socket.h>
#include <sys/un.h>

#include <algorithm>
#include <cerrno>
#include <cstddef>
#include <cstdlib>
#include <iterator>
#include <utility>

namespace velmora {

namespace {

std::string addressFromEnvironment() {
    const char* address = std::getenv("NOTIFY_SOCKET");
    return address ? address : "";
}

void logFailure(const std::string& address, const std::string& why) {
    logFormat(LogPriority::Error, "service manager at %s: %s", address.c_str(), why.c_str());
}

} // namespace

ServiceManager::ServiceManager() : ServiceManager(addressFromEnvironment()) {}

ServiceManager::ServiceManager(std::string address) : _address(std::move(address)) {
    sockaddr_un limits = {};
    if (_address.empty())
        return;
    if (_address.front() != '/' && _address.front() != '@') {
        logFailure(_address, "no socket's name, wanted an absolute path or '@' and a name");
        _address.clear();
    } else if (_address.size() >= sizeof limits.sun_path) {
        logFailure(_address, "a name of " + std::to_string(_address.size()) + " bytes, wanted at most " +
                                 std::to_string(sizeof limits.sun_path - 1));
        _address.clear();
    }
}

void ServiceManager::ready(std::string_view status) const {
    std::string message = "READY=1\nSTATUS=";
    // A line break would begin another assignment.
    std::transform(status.begin(), status.end(), std::back_inserter(message),
                   [](char c) { return c == '\n' ? ' ' : c; });
    send(message);
}

void ServiceManager::stopping() const {
    send("STOPPING=1");
}

void ServiceManager::send(std::string_view message) const {
    if (_address.empty())
        return;
    sockaddr_un address = {};
    address.sun_family = AF_UNIX;
    std::copy(_address.begin(), _address.end(), address.sun_path);
    if (_address.front() == '@')
        address.sun_path[0] = '\0';
    const auto size = static_cast<socklen_t>(offsetof(sockaddr_un, sun_path) + _address.size());
    // Never waits: a manager that does not read must not stop the service.
    const FileDescriptor socket(::socket(AF_UNIX, SOCK_DGRAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0));
    if (!socket || ::sendto(socket.get(), message.data(), message.size(), MSG_NOSIGNAL,
                            reinterpret_cast<const sockaddr*>(&address), size) < 0)
        logFailure(_address, errnoText(errno));
}

} // namespace velmora
