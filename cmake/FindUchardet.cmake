# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Finds uchardet, which tells the encoding of a text, as the target Uchardet::Uchardet.

find_path(Uchardet_INCLUDE_DIR uchardet/uchardet.h)
find_library(Uchardet_LIBRARY uchardet)

include(FindPackageHandleStandardArgs)
find_package_handle_standard_args(Uchardet
    REQUIRED_VARS Uchardet_LIBRARY Uchardet_INCLUDE_DIR
    REASON_FAILURE_MESSAGE "On Debian it is in the package libuchardet-dev")
mark_as_advanced(Uchardet_INCLUDE_DIR Uchardet_LIBRARY)

if(Uchardet_FOUND AND NOT TARGET Uchardet::Uchardet)
    add_library(Uchardet::Uchardet UNKNOWN IMPORTED)
    set_target_properties(Uchardet::Uchardet PROPERTIES
        IMPORTED_LOCATION "${Uchardet_LIBRARY}"
        INTERFACE_INCLUDE_DIRECTORIES "${Uchardet_INCLUDE_DIR}")
endif()
