// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"

#include <cstdint>
#include <string_view>
#include <vector>

namespace velmora {

class Output;

/// Output that is kept for later in a file without a name, in the directory of temporary files (TMPDIR or
/// /tmp). Without such a directory, or on a file system that has no files without a name, it keeps nothing.
class Spool {
public:
    /// The size at which it is full; the last text may exceed it.
    static constexpr std::uint64_t maximumSize = std::uint64_t{256} << 20;

    Spool();

    /// In another process: closes its copy of the descriptor.
    void closeCopy() { _file.reset(); }

    [[nodiscard]] bool hasRoom() const { return _file.get() >= 0 && _size < maximumSize; }

    /// False where the file did not take all of the text; then none of it is kept.
    [[nodiscard]] bool append(std::string_view text);

    /// Writes everything to the output and closes the file. `buffer` is used for reading. False where the
    /// file cannot be read back.
    [[nodiscard]] bool moveTo(Output& output, std::vector<char>& buffer);

private:
    FileDescriptor _file;
    std::uint64_t _size = 0;
};

} // namespace velmora
