// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"

#include <cstddef>
#include <cstdint>
#include <span>

namespace velmora {

/// Where a reader gets its bytes from: a file, a pipe, a test's memory. Read once, front to back. Main thread
/// only.
class ByteSource {
public:
    virtual ~ByteSource() = default;
    /// Puts the next bytes at the front of `buffer`, waiting until there is one at least. Gives their number,
    /// which may be less than the buffer takes; 0 at the end alone. Precondition: the buffer is not empty.
    virtual Result<std::size_t> read(std::span<std::uint8_t> buffer) = 0;
};

} // namespace velmora
