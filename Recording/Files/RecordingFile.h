// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <cstddef>
#include <cstdint>
#include <optional>

namespace velmora {

/// What a recording is written to: a file, a pipe, a test's memory. Errors are errno values, 0 being none.
/// Main thread only.
class RecordingFile {
public:
    struct Written {
        std::size_t bytes = 0;
        int error = 0;
    };

    virtual ~RecordingFile() = default;

    /// Writes bytes behind those written before, some at least unless there is an error. Waits where the
    /// reader of a pipe does.
    virtual Written write(Bytes bytes) = 0;
    /// Whether what is written can be taken back and put on a medium, as in a regular file. The operations
    /// below are for such files alone.
    [[nodiscard]] virtual bool isRegular() const = 0;
    /// Takes back all but the first `size` bytes that were written; the next ones go behind these.
    virtual int cutTo(std::uint64_t size) = 0;
    /// Begins to have all that was written put on the medium, and does not wait for it. Does nothing while an
    /// earlier call's outcome has not been taken.
    virtual void startSync() = 0;
    /// How `startSync` ended; none while it goes on, and once the outcome has been taken.
    virtual std::optional<int> takeSyncOutcome() = 0;
    /// Has all that was written put on the medium, and waits for it. An earlier call's outcome is gone then.
    virtual int sync() = 0;
    /// The last call.
    virtual int close() = 0;
};

} // namespace velmora
