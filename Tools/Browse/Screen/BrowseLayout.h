// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Terminal/ScreenSize.h"

#include <cstddef>

namespace velmora {

/// How the parts share a screen: the list above, display, bytes and events beside each other below it, the
/// strip of levels and the status line at the bottom. A narrow screen shows bytes and events in turn; a very
/// small one has the list alone.
struct BrowseLayout {
    std::size_t columns = 0;
    std::size_t listRows = 0;
    std::size_t lowerRows = 0; ///< without their heading; 0 where there are none
    std::size_t stripRows = 0;
    std::size_t displayColumns = 0;
    std::size_t bytesColumns = 0;
    std::size_t eventsColumns = 0; ///< 0 where events take the place of the bytes
    std::size_t bytesPerLine = 8;

    [[nodiscard]] static BrowseLayout of(ScreenSize size);
};

} // namespace velmora
