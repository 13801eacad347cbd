// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

/// What velmora-log ends with.
namespace velmora::ExitStatus {

inline constexpr int Done = 0;
inline constexpr int BadInput = 1; ///< what was to be read, or where it was to be written, gave trouble
inline constexpr int Usage = 2;

} // namespace velmora::ExitStatus
