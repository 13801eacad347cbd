// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Result.h"

#include <sys/types.h>

#include <filesystem>
#include <string>

namespace velmora {

/// A file in the making: it is written beside the one whose place it takes in the end, in one step, so that a
/// failure leaves what was there and no part of it is ever visible. A draft that is not published is removed.
/// Reasons are ready to follow "file: ".
class FileDraft {
public:
    enum class WhereThereIsOne { Replace, Refuse };

    /// `mode`: the permissions where there is no file to take them from, less the process's mask.
    static Result<FileDraft> create(const std::filesystem::path& target, mode_t mode);
    ~FileDraft() { discard(); }
    FileDraft(FileDraft&& other) noexcept;
    FileDraft& operator=(FileDraft&&) = delete;

    /// Where the content goes; stays the draft's.
    [[nodiscard]] int descriptor() const { return _file.get(); }
    /// The draft's own name.
    [[nodiscard]] const std::string& path() const { return _path; }

    /// Has the content put on the disk, and then gives it its name. The draft is gone after that, whatever
    /// the outcome.
    Result<Done> publish(WhereThereIsOne choice);
    /// Removes the draft.
    void discard();

private:
    FileDraft(std::filesystem::path target, std::string path, FileDescriptor file);

    std::filesystem::path _target;
    std::string _path; ///< empty when there is no draft any more
    FileDescriptor _file;
};

} // namespace velmora
