# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# nettle::nettle, the library of hash functions, whose Debian package has no CMake configuration.

find_path(NETTLE_INCLUDE_DIR nettle/hmac.h)
find_library(NETTLE_LIBRARY nettle)
mark_as_advanced(NETTLE_INCLUDE_DIR NETTLE_LIBRARY)

include(FindPackageHandleStandardArgs)
find_package_handle_standard_args(nettle REQUIRED_VARS NETTLE_LIBRARY NETTLE_INCLUDE_DIR)

if(nettle_FOUND AND NOT TARGET nettle::nettle)
    add_library(nettle::nettle UNKNOWN IMPORTED)
    set_target_properties(nettle::nettle PROPERTIES IMPORTED_LOCATION ${NETTLE_LIBRARY}
                          INTERFACE_INCLUDE_DIRECTORIES ${NETTLE_INCLUDE_DIR})
endif()
