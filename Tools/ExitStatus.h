// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

/// The exit status of velmora-log.
namespace velmora::ExitStatus {

inline constexpr int Done = 0;
inline constexpr int BadInput = 1; ///< the input was bad, or the output could not be written
inline constexpr int Usage = 2;
inline constexpr int Severe = 3; ///< an event of the severity that --fail-on names

} // namespace velmora::ExitStatus
