// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>

namespace velmora {

/// The destination of a recording: a file, a pipe, a test's memory. Errors are errno values, 0 being none.
/// Main thread only.
class OutputFile {
public:
    struct Written {
        std::size_t bytes = 0;
        int error = 0;
    };

    /// What others have done to a file that is being written. Its name, where it has one, is to lead to it,
    /// and its length to be that of what was written.
    struct Change {
        enum class Kind : std::uint8_t {
            None,
            Removed,
            Moved,     ///< its name leads nowhere
            Replaced,  ///< its name leads to another file
            Truncated, ///< it is shorter than what was written
            Altered,   ///< it is longer
        };
        Kind kind = Kind::None;
        std::uint64_t intact = 0; ///< how much of what was written is still in a file that has a name
    };

    /// What happened to the file, to follow its name: "was removed". Precondition: there is a change.
    [[nodiscard]] static std::string_view describe(Change::Kind kind);

    virtual ~OutputFile() = default;

    /// Appends bytes, at least one unless there is an error. Blocks while a pipe is full.
    virtual Written write(Bytes bytes) = 0;
    /// Whether the file can be truncated and synced, as a regular file can. The operations below are for such
    /// files only.
    [[nodiscard]] virtual bool isRegular() const = 0;
    /// What others have done so far. Once there is a change, nothing more may be written.
    [[nodiscard]] virtual Change change() const { return {}; }
    /// Truncates the file to the first `size` bytes that were written; writing continues after these.
    virtual int truncateTo(std::uint64_t size) = 0;
    /// Starts to sync all that was written, in the background. Does nothing while an earlier call's outcome
    /// has not been taken.
    virtual void startSync() = 0;
    /// How `startSync` ended; none while it is running, and once the outcome has been taken.
    virtual std::optional<int> takeSyncResult() = 0;
    /// Syncs all that was written and waits for it. Discards the outcome of `startSync`.
    virtual int sync() = 0;
    /// The last call.
    virtual int close() = 0;
};

} // namespace velmora
