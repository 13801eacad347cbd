# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# zstd::zstd, the library of Zstandard, whose Debian package has no CMake configuration.

find_path(ZSTD_INCLUDE_DIR zstd.h)
find_library(ZSTD_LIBRARY zstd)
mark_as_advanced(ZSTD_INCLUDE_DIR ZSTD_LIBRARY)

include(FindPackageHandleStandardArgs)
find_package_handle_standard_args(zstd REQUIRED_VARS ZSTD_LIBRARY ZSTD_INCLUDE_DIR)

if(zstd_FOUND AND NOT TARGET zstd::zstd)
    add_library(zstd::zstd UNKNOWN IMPORTED)
    set_target_properties(zstd::zstd PROPERTIES IMPORTED_LOCATION ${ZSTD_LIBRARY}
                          INTERFACE_INCLUDE_DIRECTORIES ${ZSTD_INCLUDE_DIR})
endif()
