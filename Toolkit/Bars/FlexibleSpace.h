// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Bars/ToolbarItem.h"

namespace velmora {

/// Takes the space that the other items of the toolbar leave.
class FlexibleSpace : public ToolbarItem {};

} // namespace velmora
