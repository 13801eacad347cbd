# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# What release builds are hardened with. PERFORMANCE.md says what it costs, and what was left out for that.

include(CheckCXXCompilerFlag)
include(CheckCXXSourceCompiles)

# Level 3 of checked copying also checks sizes that are known only at run time. Older compilers and C libraries have
# level 2.
set(CMAKE_REQUIRED_FLAGS "-O2 -U_FORTIFY_SOURCE -D_FORTIFY_SOURCE=3")
check_cxx_source_compiles("
    #include <cstring>
    #if !defined __USE_FORTIFY_LEVEL || __USE_FORTIFY_LEVEL < 3
    #error Level 2 is the highest.
    #endif
    int main() { return 0; }" VELMORA_HAS_FORTIFY_LEVEL_3)
unset(CMAKE_REQUIRED_FLAGS)

# clang before 16 has zero initialization only together with a second option.
set(velmora_zero_options -ftrivial-auto-var-init=zero)
check_cxx_compiler_flag("${velmora_zero_options}" VELMORA_HAS_ZERO_INITIALIZATION)
if(NOT VELMORA_HAS_ZERO_INITIALIZATION AND CMAKE_CXX_COMPILER_ID MATCHES Clang)
    list(APPEND velmora_zero_options -enable-trivial-auto-var-init-zero-knowing-it-will-be-removed-from-clang)
    check_cxx_compiler_flag("${velmora_zero_options}" VELMORA_HAS_ZERO_INITIALIZATION_WITH_ENABLER)
endif()

# velmora_harden(TARGET): adds the options to an interface library.
function(velmora_harden target)
    set(level 2)
    if(VELMORA_HAS_FORTIFY_LEVEL_3)
        set(level 3)
    endif()
    target_compile_options(${target} INTERFACE -U_FORTIFY_SOURCE -D_FORTIFY_SOURCE=${level} -fstack-clash-protection)
    if(VELMORA_HAS_ZERO_INITIALIZATION OR VELMORA_HAS_ZERO_INITIALIZATION_WITH_ENABLER)
        target_compile_options(${target} INTERFACE ${velmora_zero_options})
    endif()
    if(CMAKE_SYSTEM_PROCESSOR MATCHES "x86_64|i.86")
        target_compile_options(${target} INTERFACE -fcf-protection)
    elseif(CMAKE_SYSTEM_PROCESSOR MATCHES "aarch64")
        target_compile_options(${target} INTERFACE -mbranch-protection=standard)
    endif()
endfunction()

# velmora_fortify_less(FILE...): level 2 in these sources of the folder, which append many short texts to a buffer. Level
# 3 finds no size to check there, but the compiler makes more of the short copies by calls.
function(velmora_fortify_less)
    get_target_property(options velmora_options INTERFACE_COMPILE_OPTIONS)
    if("-D_FORTIFY_SOURCE=3" IN_LIST options)
        set_source_files_properties(${ARGN} PROPERTIES COMPILE_OPTIONS "-U_FORTIFY_SOURCE;-D_FORTIFY_SOURCE=2"
                                    SKIP_PRECOMPILE_HEADERS ON)
    endif()
endfunction()
