// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

/// For a program that decodes live, called once at its start: large pieces of memory go back to the system as
/// soon as they are given up. Left alone, the C library takes the release of one as a sign to keep the next
/// in its heap, and the messages of each refresh, which come and go among what stays, would stretch that for
/// hours.
void giveBackLargeMemory();

} // namespace velmora
