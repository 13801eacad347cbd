// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Recording/MessageReader.h"
#include "Recording/Refreshes/RefreshTicks.h"

#include <cstdint>
#include <optional>

namespace velmora {

/// When a file's display is refreshed while its messages are decoded in order: on the grid of RefreshTicks,
/// or where the file itself says when (a snapshot does).
class Refreshes {
public:
    /// The refresh that is due before this message is decoded, if any.
    [[nodiscard]] std::optional<Time> before(const LoggedMessage& message) {
        _fileHasRefreshes = _fileHasRefreshes || message.refresh;
        const std::optional<Time> tick = _ticks.tickBefore(message.time);
        // Without a message since the last one there is nothing to show, as after a refresh by `by`.
        return tick && _isPending && !_fileHasRefreshes ? tick : std::nullopt;
    }
    /// The refresh that is due by this time, if any, whether or not a message follows.
    [[nodiscard]] std::optional<Time> by(Time time) {
        return _isPending && !_fileHasRefreshes ? _ticks.tickBefore(time) : std::nullopt;
    }
    /// The message is skipped without being decoded: the refresh that is due after it, if any.
    [[nodiscard]] std::optional<Time> afterSkipped(const LoggedMessage& message) {
        _fileHasRefreshes = _fileHasRefreshes || message.refresh;
        return _isPending ? message.refresh : std::nullopt;
    }
    /// The message has been decoded: the refresh that is due after it, if any.
    [[nodiscard]] std::optional<Time> after(const LoggedMessage& message) {
        _isPending = true;
        return message.refresh;
    }
    /// The refresh that follows the last message; none where there has been one since.
    [[nodiscard]] std::optional<Time> last() const { return _isPending ? _ticks.last() : std::nullopt; }

    /// There was a refresh.
    void done() {
        _isPending = false;
        ++_count;
    }
    [[nodiscard]] std::uint64_t count() const { return _count; }

private:
    RefreshTicks _ticks;
    bool _fileHasRefreshes = false; ///< if so, there are no other refreshes
    bool _isPending = false;        ///< a message has been decoded since the last refresh
    std::uint64_t _count = 0;
};

} // namespace velmora
