// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Result.h"

#include <sys/socket.h>
#include <sys/un.h>

#include <filesystem>
#include <string>
#include <string_view>

namespace velmora {

/// A socket's address for the system calls.
struct PortAddress {
    sockaddr_un address = {};
    socklen_t size = 0;
};

/// The open directory in which the ports' sockets and lock files lie. It belongs to the process's user and
/// no other user can write to it.
class PortDirectory {
public:
    /// Opens `path`, creating it (mode 0700) and its missing parents. A directory of another user, or one
    /// that grants others one of the permissions `forbidden`, is refused.
    static Result<PortDirectory> open(const std::filesystem::path& path, mode_t forbidden);

    /// Opens the directory that the environment names: $VELMORA_PORT_DIR, $XDG_RUNTIME_DIR/velmora, or else
    /// /tmp/velmora-UID. In the two default directories others may have no permission at all.
    static Result<PortDirectory> openStandard();

    [[nodiscard]] const std::filesystem::path& path() const { return _path; }
    [[nodiscard]] int descriptor() const { return _descriptor.get(); }

    /// The address of a socket in the directory, however long the directory's path is.
    [[nodiscard]] PortAddress addressOf(const std::string& name) const;

    /// Why `name` can name no port; success when it can: 1 to 80 bytes without '/' or NUL that do not begin
    /// with '.' nor end in ".lock", the ending of the files that keep names taken.
    static Result<Done> checkName(std::string_view name);

private:
    PortDirectory(std::filesystem::path path, FileDescriptor descriptor)
        : _path(std::move(path)), _descriptor(std::move(descriptor)) {}

    std::filesystem::path _path;
    FileDescriptor _descriptor;
};

} // namespace velmora
