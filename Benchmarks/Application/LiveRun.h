// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

/// How the application does for so many seconds while messages arrive from a telephony service: prints it.
/// `probes`: whether the event loop's latency is measured. The exit status.
[[nodiscard]] int runLive(int argc, char** argv, int seconds, bool probes, bool hasDrive);

} // namespace velmora
