# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Finds the part of HarfBuzz that cuts fonts down, as the target HarfBuzz::Subset.

find_path(HarfBuzzSubset_INCLUDE_DIR hb-subset.h PATH_SUFFIXES harfbuzz)
find_library(HarfBuzzSubset_LIBRARY harfbuzz-subset)
find_library(HarfBuzzSubset_CORE_LIBRARY harfbuzz)

include(FindPackageHandleStandardArgs)
find_package_handle_standard_args(HarfBuzzSubset
    REQUIRED_VARS HarfBuzzSubset_LIBRARY HarfBuzzSubset_CORE_LIBRARY HarfBuzzSubset_INCLUDE_DIR
    REASON_FAILURE_MESSAGE "On Debian it is in the package libharfbuzz-dev")
mark_as_advanced(
    HarfBuzzSubset_INCLUDE_DIR HarfBuzzSubset_LIBRARY HarfBuzzSubset_CORE_LIBRARY)

if(HarfBuzzSubset_FOUND AND NOT TARGET HarfBuzz::Subset)
    add_library(HarfBuzz::Subset UNKNOWN IMPORTED)
    set_target_properties(HarfBuzz::Subset PROPERTIES
        IMPORTED_LOCATION "${HarfBuzzSubset_LIBRARY}"
        INTERFACE_LINK_LIBRARIES "${HarfBuzzSubset_CORE_LIBRARY}"
        INTERFACE_INCLUDE_DIRECTORIES "${HarfBuzzSubset_INCLUDE_DIR}")
endif()
