# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Removes the files that the manifests of the folder MANIFESTS name; folders stay.

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
    endforeach()
endforeach()
