// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

namespace velmora {

/// The writer's name in a file's metadata, as the format has it: name, version, build. The version is that of
/// what is written, so that the same input makes the same file whatever the program's own version.
inline constexpr std::string_view writtenBy = "velmora-log version 1.0.0 (build 1)";

} // namespace velmora
