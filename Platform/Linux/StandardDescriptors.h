// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

/// Opens /dev/null as each of the descriptors 0 to 2 that was closed when the program started. Otherwise the
/// next files opened would get their numbers: log lines meant for standard error would end up in a recording,
/// or in the pipe that signals are forwarded through. The first thing that `main` does.
void openClosedStandardDescriptors();

} // namespace velmora
