// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"

#include <cerrno>
#include <optional>

#include <sys/socket.h>

namespace velmora {

/// What a job's process and the one that started it send each other, a byte each.
enum class TurnMessage : char {
    IsFirst = 'F',  ///< to the job: it is first in line
    IsHeld = 'H',   ///< from the job: the spool has all of its output so far, and gets no more
    MayWrite = 'W', ///< to the job: the spool has been written, the output is the job's
};

/// False where the other process has ended.
[[nodiscard]] inline bool send(const FileDescriptor& channel, TurnMessage message) {
    const char byte = static_cast<char>(message);
    return ::send(channel.get(), &byte, 1, MSG_NOSIGNAL) == 1;
}

/// The next message; absent where the other process has ended, or none has come yet and `flags` has
/// MSG_DONTWAIT.
[[nodiscard]] inline std::optional<TurnMessage> receive(const FileDescriptor& channel, int flags = 0) {
    char byte = 0;
    ssize_t count = 0;
    do
        count = ::recv(channel.get(), &byte, 1, flags);
    while (count < 0 && errno == EINTR);
    return count == 1 ? std::optional(static_cast<TurnMessage>(byte)) : std::nullopt;
}

} // namespace velmora
