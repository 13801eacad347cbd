#pragma once

namespace velmora {

/// What velmora-log ends with.
namespace ExitStatus {
inline constexpr int Done = 0;
inline constexpr int BadInput = 1; ///< what was to be read, or where it was to be written, gave trouble
inline constexpr int Usage = 2;
} // namespace ExitStatus

} // namespace velmora
