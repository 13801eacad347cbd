// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Result.h"

#include <string>

#include <sys/types.h>

namespace velmora {

[[nodiscard]] bool isRegularFile(int descriptor);

/// The file of a recording as a recorder holds it: open for writing, and locked against other recorders as
/// long as a copy of the descriptor is open.
struct RecordingFile {
    static constexpr mode_t newFileMode = 0600;

    std::string path;
    FileDescriptor descriptor;
    bool isCreated = false; ///< it was not there before

    /// Creates the file, or opens the one that is there: a regular file only with `force`, and without
    /// changing its content.
    static Result<RecordingFile> open(const std::string& path, bool force);
    /// Creates a file beside that one whose name is free: "drive-2.pcapng" for "drive.pcapng".
    static Result<RecordingFile> createBeside(const std::string& path);

    [[nodiscard]] bool isRegular() const { return isRegularFile(descriptor.get()); }
    [[nodiscard]] bool isEmpty() const;
    /// Removes the file if it was created and is still empty. Allocates nothing.
    void removeIfEmpty() const;
};

/// Locks a file against other recorders; false if one has it. A file system without locks has no other.
[[nodiscard]] bool lockRecording(int descriptor);

} // namespace velmora
