# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Removes the files that the manifests of the folder MANIFESTS name, and the folders of our own that are
# empty then; folders that other software may use stay.

file(GLOB manifests "${MANIFESTS}/install_manifest*.txt")
if(NOT manifests)
    message(FATAL_ERROR "Nothing was installed from ${MANIFESTS}")
endif()
foreach(manifest IN LISTS manifests)
    file(STRINGS "${manifest}" files)
    foreach(name IN LISTS files)
        if(EXISTS "$ENV{DESTDIR}${name}" OR IS_SYMLINK "$ENV{DESTDIR}${name}")
            message(STATUS "Removing $ENV{DESTDIR}${name}")
            file(REMOVE "$ENV{DESTDIR}${name}")
        endif()
        cmake_path(GET name PARENT_PATH folder)
        while(folder MATCHES "[Pp]elloric")
            # Refuses a folder that holds anything.
            execute_process(COMMAND rmdir "$ENV{DESTDIR}${folder}" RESULT_VARIABLE failed ERROR_QUIET)
            if(failed)
                break()
            endif()
            cmake_path(GET folder PARENT_PATH folder)
        endwhile()
    endforeach()
endforeach()
