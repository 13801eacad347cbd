# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# Run by cpack on the staged trees before they become packages.

# Manual pages and change logs are compressed, without the time, so that the packages depend on nothing but the source.
file(GLOB_RECURSE plain LIST_DIRECTORIES false
     ${CPACK_TEMPORARY_DIRECTORY}/*/usr/share/man/*.[1-8]
     ${CPACK_TEMPORARY_DIRECTORY}/*/usr/share/doc/*/changelog)
foreach(file IN LISTS plain)
    execute_process(COMMAND gzip -9n ${file} COMMAND_ERROR_IS_FATAL ANY)
endforeach()

# Programs keep nothing that running them does not take.
file(GLOB programs ${CPACK_TEMPORARY_DIRECTORY}/*/usr/bin/*)
execute_process(COMMAND ${CPACK_VELMORA_STRIP} --strip-all --remove-section=.comment --remove-section=.note ${programs}
                COMMAND_ERROR_IS_FATAL ANY)

# The directories are everybody's to read, whatever the mask of who packs.
file(GLOB_RECURSE entries LIST_DIRECTORIES true ${CPACK_TEMPORARY_DIRECTORY}/*)
foreach(entry IN LISTS entries)
    if(IS_DIRECTORY ${entry})
        file(CHMOD ${entry} DIRECTORY_PERMISSIONS OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE
             WORLD_READ WORLD_EXECUTE)
    endif()
endforeach()
