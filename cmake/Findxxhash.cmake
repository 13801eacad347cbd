# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# xxhash::xxhash, the library of fast hashes, whose Debian package has no CMake configuration.

find_path(XXHASH_INCLUDE_DIR xxhash.h)
find_library(XXHASH_LIBRARY xxhash)
mark_as_advanced(XXHASH_INCLUDE_DIR XXHASH_LIBRARY)

include(FindPackageHandleStandardArgs)
find_package_handle_standard_args(xxhash REQUIRED_VARS XXHASH_LIBRARY XXHASH_INCLUDE_DIR)

if(xxhash_FOUND AND NOT TARGET xxhash::xxhash)
    add_library(xxhash::xxhash UNKNOWN IMPORTED)
    set_target_properties(xxhash::xxhash PROPERTIES IMPORTED_LOCATION ${XXHASH_LIBRARY}
                          INTERFACE_INCLUDE_DIRECTORIES ${XXHASH_INCLUDE_DIR})
endif()
