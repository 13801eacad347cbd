// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"

#include <span>
#include <string_view>

namespace velmora {

/// The catalogue of the technology that a rule file means: by its short name or without the maker, in any
/// case ("Ostrel_UTRAN2", "utran"). Null for any other text.
[[nodiscard]] const Catalogue* catalogueNamed(std::span<const Catalogue* const> catalogues,
                                              std::string_view text);

} // namespace velmora
