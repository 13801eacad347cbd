// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cerrno>

namespace velmora {

/// A path at which the running test program can be started once more: the one that it was started by itself,
/// since /proc/self/exe is the emulator where the tests run under one.
inline const char* ownProgram() {
    return program_invocation_name;
}

} // namespace velmora
