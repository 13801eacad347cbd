// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/PortDirectory.h"

#include "Platform/Linux/Errno.h"
#include "Platform/MessagePort.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <algorithm>
#include <cerrno>
#include <cstddef>
#include <cstdio>
#include <cstdlib>

namespace velmora {

namespace {

constexpr mode_t forOthers = S_IRWXG | S_IRWXO;
constexpr mode_t writableByOthers = S_IWGRP | S_IWOTH;

std::string octal(mode_t mode) {
    char text[16];
    std::snprintf(text, sizeof text, "%04o", static_cast<unsigned>(mode & 07777));
    return text;
}

const char* nonEmpty(const char* variable) {
    const char* value = std::getenv(variable);
    return value && *value ? value : nullptr;
}

} // namespace

Result<PortDirectory> PortDirectory::open(const std::filesystem::path& path, mode_t forbidden) {
    const std::string name = "port directory " + path.string();
    std::error_code ignored; // what cannot be made above it shows when it cannot be made itself
    if (path.has_parent_path())
        std::filesystem::create_directories(path.parent_path(), ignored);
    if (::mkdir(path.c_str(), S_IRWXU) != 0 && errno != EEXIST)
        return Failure{name + " cannot be made: " + errnoText(errno)};
    // A symbolic link in a world-writable directory could be any user's.
    FileDescriptor descriptor(::open(path.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC | O_NOFOLLOW));
    struct stat status = {};
    if (!descriptor || ::fstat(descriptor.get(), &status) != 0)
        return Failure{name + " cannot be opened: " + errnoText(errno)};
    if (status.st_uid != ::geteuid())
        return Failure{name + " belongs to user " + std::to_string(status.st_uid) + ", wanted user " +
                       std::to_string(::geteuid())};
    if ((status.st_mode & forbidden) != 0)
        return Failure{name + " has mode " + octal(status.st_mode) + ", wanted 0700"};
    return PortDirectory(path, std::move(descriptor));
}

Result<PortDirectory> PortDirectory::openStandard() {
    if (const char* directory = nonEmpty("VELMORA_PORT_DIR"))
        return open(directory, writableByOthers);
    if (const char* runtime = nonEmpty("XDG_RUNTIME_DIR"); runtime && *runtime == '/')
        return open(std::filesystem::path(runtime) / "velmora", forOthers);
    return open("/tmp/velmora-" + std::to_string(::geteuid()), forOthers);
}

PortAddress PortDirectory::addressOf(const std::string& name) const {
    PortAddress result;
    result.address.sun_family = AF_UNIX;
    std::string place = (_path / name).string();
    // The plain path where it fits, so that tools that list sockets show it.
    if (place.size() >= sizeof result.address.sun_path)
        place = "/proc/self/fd/" + std::to_string(_descriptor.get()) + "/" + name;
    std::copy(place.begin(), place.end(), result.address.sun_path);
    result.size = static_cast<socklen_t>(offsetof(sockaddr_un, sun_path) + place.size() + 1);
    return result;
}

Result<Done> PortDirectory::checkName(std::string_view name) {
    if (name.empty())
        return Failure{"an empty port name"};
    const std::string found = "port name \"" + std::string(name) + "\"";
    if (name.size() > maximumPortNameSize)
        return Failure{found + " of " + std::to_string(name.size()) + " bytes, wanted at most " +
                       std::to_string(maximumPortNameSize)};
    if (name.front() == '.')
        return Failure{found + " begins with '.'"};
    if (name.find('/') != name.npos || name.find('\0') != name.npos)
        return Failure{found + " holds a '/' or NUL"};
    if (name.ends_with(".lock"))
        return Failure{found + " ends in \".lock\""};
    return Done();
}

} // namespace velmora
