// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstdint>
#include <string>

namespace velmora {

/// A place of a display that messages change: what is under a key of one of the display's dictionaries. All
/// else in the display stays as it is. Belongs to the display and the decoder.
struct ChangingPlace {
    const Dictionary* dictionary;
    std::string key;
    /// How many records have changed what is there; two that are equal leave it as it was.
    const std::uint64_t* changes;
};

} // namespace velmora
