// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Browse/Screen/BrowseView.h"
#include "Tools/Browse/Screen/Characters.h"
#include "Tools/Terminal/ScreenSize.h"
#include "Tools/Terminal/StyledText.h"

#include <vector>

namespace velmora {

/// The screen: as many lines as it has rows, each as wide as it is.
[[nodiscard]] std::vector<StyledLine> browseScreen(const BrowseView& view, ScreenSize size,
                                                   Characters characters);

} // namespace velmora
