// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"

#include <cstdint>
#include <string_view>

namespace velmora {

class Output;
class SpoolBudget;

/// Output that is kept for later in a file without a name, in the directory of temporary files (TMPDIR or
/// /tmp). One process appends to it, while another moves what is there already. Without such a directory, or
/// on a file system that has no files without a name, it keeps nothing.
class Spool {
public:
    /// `budget` must outlive it.
    explicit Spool(SpoolBudget& budget);

    [[nodiscard]] static const char* directory();

    /// Closes this process's copy of the descriptor; nothing is kept any more.
    void close() { _file.reset(); }

    /// Keeps what there is room for; returns the rest.
    [[nodiscard]] std::string_view append(std::string_view text);

    /// Writes what has been appended since the last time. False where the file cannot be read back.
    [[nodiscard]] bool moveTo(Output& output);

    /// Closes it after the last byte has been moved, or is of no use any more, and gives back its room. For
    /// the process that moves.
    void discard();

private:
    [[nodiscard]] std::uint64_t size() const;

    SpoolBudget& _budget;
    FileDescriptor _file;
    std::uint64_t _moved = 0;
};

} // namespace velmora
