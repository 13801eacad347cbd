// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/Fix.h"
#include "Platform/Result.h"

#include <cstddef>
#include <functional>
#include <optional>
#include <vector>

namespace velmora {

/// The fixes of a track as they come between the messages of a recording: those from shortly before the first
/// message until shortly after the last.
class AddedPositions {
public:
    using Add = std::function<Result<Done>(const Fix& fix)>;

    /// In the order of their times; they must outlive it.
    explicit AddedPositions(const std::vector<Fix>& fixes) : _fixes(fixes) {}

    /// Adds those before the next message.
    [[nodiscard]] Result<Done> upTo(Time message, const Add& add);
    /// Adds those after the last message. Fails where none of the track's fixes lay in the recording's time.
    [[nodiscard]] Result<Done> finish(const Add& add);

private:
    const std::vector<Fix>& _fixes;
    std::size_t _next = 0;
    std::size_t _added = 0;
    std::optional<Time> _last; ///< message
};

} // namespace velmora
