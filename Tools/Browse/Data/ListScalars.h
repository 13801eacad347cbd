// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace velmora {

/// Bytes of a message that hold one value, and others that hold another value of the same kind.
struct ChangedBytes {
    std::size_t begin = 0;
    std::size_t end = 0;
    std::vector<std::uint8_t> others; ///< in place of them, perhaps more or fewer
};

/// The scalars of a property list, in XML or binary, each with another value: numbers, texts, dates, data and
/// truth values, but no keys of dictionaries. What is shared by several places of a binary list is there
/// once. Scalars without a byte that can be changed, such as empty texts, are left out. Offsets count from
/// the list's start. `most`: none at all where there are more.
[[nodiscard]] std::vector<ChangedBytes> listScalars(Bytes list, std::size_t most);

} // namespace velmora
