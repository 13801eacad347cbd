# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# libgps::libgps, gpsd's library for its clients, whose Debian package has no CMake configuration.

find_path(LIBGPS_INCLUDE_DIR gps.h)
find_library(LIBGPS_LIBRARY gps)
mark_as_advanced(LIBGPS_INCLUDE_DIR LIBGPS_LIBRARY)

include(FindPackageHandleStandardArgs)
find_package_handle_standard_args(libgps REQUIRED_VARS LIBGPS_LIBRARY LIBGPS_INCLUDE_DIR)

if(libgps_FOUND AND NOT TARGET libgps::libgps)
    add_library(libgps::libgps UNKNOWN IMPORTED)
    set_target_properties(libgps::libgps PROPERTIES IMPORTED_LOCATION ${LIBGPS_LIBRARY}
                          INTERFACE_INCLUDE_DIRECTORIES ${LIBGPS_INCLUDE_DIR})
endif()
