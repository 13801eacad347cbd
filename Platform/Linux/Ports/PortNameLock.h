// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Linux/Ports/PortDirectory.h"

#include <optional>
#include <string>

namespace velmora {

/// A port name that this process has taken. The lock is the kernel's, on a file beside the socket: it is
/// released when the process ends in any way, and its next holder owns the name and the socket. Move-only;
/// destroying it frees the name and removes the file.
class PortNameLock {
public:
    /// Takes the name; absent when it has a live owner. Precondition: `directory`'s descriptor stays open for
    /// as long as the lock is held.
    static Result<std::optional<PortNameLock>> take(const PortDirectory& directory, const std::string& name);

    PortNameLock(PortNameLock&& other) noexcept = default;
    PortNameLock& operator=(PortNameLock&& other) = delete;
    ~PortNameLock();

    /// Whether the lock file is still the one that was locked; false when it has been removed, so that
    /// the name may have another owner by now.
    [[nodiscard]] bool holds() const;

private:
    PortNameLock(int directory, std::string file, FileDescriptor lock)
        : _directory(directory), _file(std::move(file)), _lock(std::move(lock)) {}

    int _directory;
    std::string _file;
    FileDescriptor _lock;
};

} // namespace velmora
