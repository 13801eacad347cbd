// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Result.h"

#include <sys/types.h>

#include <filesystem>
#include <string>

namespace velmora {

/// A file that is written under a temporary name in its target's directory and renamed when complete, so that
/// a failure leaves the old file and a partial one is never visible. A file that is not committed is removed.
/// Reasons are ready to follow "file: ".
class AtomicFile {
public:
    enum class IfExists { Replace, Refuse };

    /// `mode`: the permissions of a new file, less the process's umask; an existing file's are kept. The
    /// temporary name is the target's with `prefix` before it and some letters after it.
    static Result<AtomicFile> create(const std::filesystem::path& target, mode_t mode,
                                     const std::string& prefix = {});
    ~AtomicFile() { discard(); }
    AtomicFile(AtomicFile&& other) noexcept;
    AtomicFile& operator=(AtomicFile&&) = delete;

    /// The descriptor to write the content to; still owned by this.
    [[nodiscard]] int descriptor() const { return _file.get(); }
    /// The temporary name.
    [[nodiscard]] const std::string& path() const { return _path; }

    /// Syncs the content to storage and renames it. The temporary file is gone afterwards, whatever the
    /// outcome.
    Result<Done> commit(IfExists choice);
    /// Removes the temporary file.
    void discard();

private:
    AtomicFile(std::filesystem::path target, std::string path, FileDescriptor file);

    std::filesystem::path _target;
    std::string _path; ///< empty once it is committed or discarded
    FileDescriptor _file;
};

} // namespace velmora
