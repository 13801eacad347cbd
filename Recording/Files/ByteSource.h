// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"

#include <cstddef>
#include <cstdint>
#include <span>

namespace velmora {

/// The source of a reader's bytes: a file, a pipe, a test's memory. Read once, sequentially. Main thread
/// only.
class ByteSource {
public:
    virtual ~ByteSource() = default;
    /// Reads the next bytes into the start of `buffer`, blocking until there is at least one. Returns their
    /// number, which may be less than the buffer's size; 0 only at the end. Precondition: the buffer is not
    /// empty.
    virtual Result<std::size_t> read(std::span<std::uint8_t> buffer) = 0;
};

} // namespace velmora
