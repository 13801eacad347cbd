// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <vector>

namespace velmora {

/// The memory of messages that lack their first byte in the input, and are therefore no part of it. They lie
/// in chunks, each of which lives as long as any of its messages; one without messages is used again.
class RestoredMessages {
public:
    static constexpr std::size_t chunkSize = std::size_t{64} << 10;

    /// The message that consists of the byte and the others.
    [[nodiscard]] Data add(std::uint8_t first, Bytes rest);

private:
    std::shared_ptr<std::vector<std::uint8_t>> _chunk;
    std::size_t _used = 0;
};

} // namespace velmora
