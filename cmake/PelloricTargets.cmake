# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# pelloric_library(NAME ALIAS SOURCES...): a library of sources below src/, found by hosts as ALIAS.
function(pelloric_library name alias)
    add_library(${name} ${ARGN})
    add_library(Pelloric::${alias} ALIAS ${name})
    set_target_properties(${name} PROPERTIES EXPORT_NAME ${alias} VERSION ${PROJECT_VERSION}
        SOVERSION ${PROJECT_VERSION_MAJOR})
    target_include_directories(${name} PUBLIC
        "$<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/src>"
        "$<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}/pelloric>")
    target_compile_features(${name} PUBLIC cxx_std_20)
    target_link_libraries(${name} PRIVATE $<BUILD_INTERFACE:pelloric_warnings>)
endfunction()

# pelloric_program(NAME SOURCES sources... LIBRARIES libraries...): an executable of this repository.
function(pelloric_program name)
    cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "SOURCES;LIBRARIES")
    add_executable(${name} ${arg_SOURCES})
    target_link_libraries(${name} PRIVATE ${arg_LIBRARIES} pelloric_warnings)
endfunction()
