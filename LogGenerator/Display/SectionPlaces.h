// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/Display/ChangingPlace.h"
#include "LogGenerator/Display/PathRests.h"
#include "PropertyLists/Value.h"

#include <vector>

namespace velmora {

/// Has the sections whose nodes are in the display write what of it is selected.
void selectSections(const ClassIndex& index, const Value& display, const PathRests& selected);

/// Where the sections' nodes are in the display, in its order.
[[nodiscard]] std::vector<ChangingPlace> sectionPlaces(const ClassIndex& index, const Value& display);

} // namespace velmora
