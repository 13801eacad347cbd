// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/Pseudonyms/Pseudonyms.h"

namespace velmora {

/// The bytes 0 to 31. The pseudonyms that tests expect under it come from an independent program.
[[nodiscard]] inline MaskKey exampleKey() {
    MaskKey key;
    for (std::size_t i = 0; i < key.bytes.size(); ++i)
        key.bytes[i] = static_cast<std::uint8_t>(i);
    return key;
}

[[nodiscard]] inline MaskOptions exampleOptions(MaskLevel level = MaskLevel::Identity) {
    return {exampleKey(), level};
}

} // namespace velmora
