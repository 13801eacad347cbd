// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"

namespace velmora {

/// Whether numbers name something, as channels and cells do, so that the difference of two says nothing.
[[nodiscard]] bool isNamingNumber(Role role);
/// The same of a leaf: by its role, by whom it identifies, and as what identifies a list's row.
[[nodiscard]] bool isNamingNumber(const CatalogueField& leaf);

} // namespace velmora
