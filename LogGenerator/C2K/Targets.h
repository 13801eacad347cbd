// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/LogCodeParser.h"
#include "LogGenerator/Display/ChangingPlace.h"
#include "LogGenerator/Display/PathRests.h"
#include "PropertyLists/Value.h"

#include <cstdint>
#include <vector>

namespace velmora::C2K {

/// Takes out of the lookup what is not selected of the display that it leads to.
void dropUnselected(Dictionary& lookup, const Value& display, const PathRests& selected);

/// Where the lookup shows what the parser publishes, with that count of its changes.
void addTargets(const LogCodeParser& parser, const Dictionary& lookup, const std::uint64_t& changes,
                std::vector<ChangingPlace>& places);

/// Whether the lookup shows anything of what the parser publishes.
[[nodiscard]] bool hasTargets(const LogCodeParser& parser, const Dictionary& lookup);

} // namespace velmora::C2K
