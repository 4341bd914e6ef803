# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Finds libdeflate, which compresses in the zlib format, as the target LibDeflate::LibDeflate.

find_path(LibDeflate_INCLUDE_DIR libdeflate.h)
find_library(LibDeflate_LIBRARY deflate)

include(FindPackageHandleStandardArgs)
find_package_handle_standard_args(LibDeflate
    REQUIRED_VARS LibDeflate_LIBRARY LibDeflate_INCLUDE_DIR
    REASON_FAILURE_MESSAGE "On Debian it is in the package libdeflate-dev")
mark_as_advanced(LibDeflate_INCLUDE_DIR LibDeflate_LIBRARY)

if(LibDeflate_FOUND AND NOT TARGET LibDeflate::LibDeflate)
    add_library(LibDeflate::LibDeflate UNKNOWN IMPORTED)
    set_target_properties(LibDeflate::LibDeflate PROPERTIES
        IMPORTED_LOCATION "${LibDeflate_LIBRARY}"
        INTERFACE_INCLUDE_DIRECTORIES "${LibDeflate_INCLUDE_DIR}")
endif()
