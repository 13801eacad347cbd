// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "PropertyLists/Value.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <vector>

namespace velmora {

/// A cache of a section's latest payloads and their values. The SIM's files and the contexts are sent
/// repeatedly without having changed, or as before, alternately in both forms: some of them are cached.
class PayloadCache {
public:
    /// What the record's payload holds, as readPropertyList returns it within the limits of a message. Large
    /// ones are not cached.
    [[nodiscard]] Result<Value> read(const Data& record);

private:
    struct Payload {
        std::vector<std::uint8_t> bytes;
        Value value;
    };
    std::array<Payload, 8> _payloads;
    std::size_t _next = 0; ///< which is replaced next
};

} // namespace velmora
