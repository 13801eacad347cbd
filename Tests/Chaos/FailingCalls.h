// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

// The fortified headers define some of the replaced functions themselves. To be included before any of them.
#undef _FORTIFY_SOURCE

#include <dlfcn.h>

/// What the parts of the library share that makes calls of a program fail; FailingCalls.cpp describes it.
namespace velmora::failing {

enum class Kind { None, Memory, Read, Write, Sync, Rename, Open };

/// Whether calls of this kind are to fail, and are counted at present.
[[nodiscard]] bool isCounted(Kind kind);
/// Counts a call. Whether it is to fail; `errno` is set then.
[[nodiscard]] bool fails(Kind kind);
/// Finds Qt's libraries, whose own calls for memory are left alone.
void findSparedLibraries();

/// The function of the C library that a function of ours replaces.
template <class Function>
Function* next(Function*, const char* name) {
    return reinterpret_cast<Function*>(::dlsym(RTLD_NEXT, name));
}

} // namespace velmora::failing
