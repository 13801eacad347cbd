# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# thrift::thrift, the library of Thrift, in whose compact protocol the metadata of column files is, and whose Debian
# package has no CMake configuration. The static one where there is one: the package of the shared one depends on Qt 5.

find_path(THRIFT_INCLUDE_DIR thrift/protocol/TCompactProtocol.h)
find_library(THRIFT_LIBRARY NAMES libthrift.a thrift)
mark_as_advanced(THRIFT_INCLUDE_DIR THRIFT_LIBRARY)

include(FindPackageHandleStandardArgs)
find_package_handle_standard_args(thrift REQUIRED_VARS THRIFT_LIBRARY THRIFT_INCLUDE_DIR)

if(thrift_FOUND AND NOT TARGET thrift::thrift)
    add_library(thrift::thrift UNKNOWN IMPORTED)
    set_target_properties(thrift::thrift PROPERTIES IMPORTED_LOCATION ${THRIFT_LIBRARY}
                          INTERFACE_INCLUDE_DIRECTORIES ${THRIFT_INCLUDE_DIR})
endif()
