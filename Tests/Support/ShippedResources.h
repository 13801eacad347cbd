// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <string_view>

/// The resources as they are shipped, for tests of what an engineer gets to see.

namespace velmora {

/// The content of that file of the project's resources, as in "LTE.plist"; std::runtime_error where it cannot
/// be read.
[[nodiscard]] Data shippedResource(std::string_view fileName);

} // namespace velmora
