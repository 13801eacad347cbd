// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

/// For a program that decodes live, called once at its start: large allocations are returned to the system as
/// soon as they are freed. By default the C library raises its mmap threshold whenever one is freed and keeps
/// the next in its heap, which the messages of each refresh would then fragment for hours.
void returnLargeAllocations();

} // namespace velmora
