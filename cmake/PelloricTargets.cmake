# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Every component of the library is two targets: a static library of its own sources, which the
# programs and tests of this repository link and which shows them all of src/, and with
# BUILD_SHARED_LIBS a shared library of the same objects, which shows what include/ exports.
# Hosts find the one that is built as Pelloric::COMPONENT.

# The kind that hosts get, and those that are made at all: the tests of installing want both. They
# compile hosts as they are, without sanitizers, which a library with them does not go with.
if(BUILD_SHARED_LIBS)
    set(PELLORIC_KIND shared)
else()
    set(PELLORIC_KIND static)
endif()
set(PELLORIC_KINDS ${PELLORIC_KIND})
if(PELLORIC_BUILD_TESTS AND PELLORIC_INSTALL AND UNIX AND NOT PELLORIC_SANITIZE)
    set(PELLORIC_KINDS static shared)
endif()

# pelloric_component(NAME COMPONENT SOURCES sources... PUBLIC targets... PRIVATE targets...
# COMPONENTS names... PACKAGES names...): a component; NAME is the static target, NAME_shared the
# shared one. COMPONENTS are those that it builds on, PACKAGES those that a host has to find when the
# library is static.
function(pelloric_component name component)
    cmake_parse_arguments(PARSE_ARGV 2 arg "" "" "SOURCES;PUBLIC;PRIVATE;COMPONENTS;PACKAGES")
    list(TRANSFORM arg_COMPONENTS PREPEND pelloric_ OUTPUT_VARIABLE below)
    list(TRANSFORM below REPLACE "^pelloric_widgets$" "pelloric")
    add_library(${name} STATIC ${arg_SOURCES})
    target_include_directories(${name} PRIVATE "${PROJECT_SOURCE_DIR}/src")
    target_link_libraries(${name} PUBLIC ${below} PRIVATE $<BUILD_INTERFACE:pelloric_warnings>)
    pelloric_precompile(${name} ${arg_PUBLIC} ${arg_PRIVATE})
    # Nothing is hidden from those who debug, nor where libraries and tests share compiled headers.
    if(NOT CMAKE_BUILD_TYPE STREQUAL "Debug" AND NOT PELLORIC_PRECOMPILED_HEADERS)
        set_target_properties(${name} PROPERTIES CXX_VISIBILITY_PRESET hidden
            VISIBILITY_INLINES_HIDDEN ON)
    endif()
    set(kinds ${name})
    if("shared" IN_LIST PELLORIC_KINDS)
        set(shared ${name}_shared)
        list(TRANSFORM below APPEND _shared OUTPUT_VARIABLE belowShared)
        # The objects of the core are part of the library of the widgets, so that there is one copy
        # of each; what else a component needs of those below it comes from their static libraries.
        add_library(${shared} SHARED $<TARGET_OBJECTS:${name}>
            $<$<STREQUAL:${component},widgets>:$<TARGET_OBJECTS:pelloric_core>>)
        if(NOT component STREQUAL "widgets")
            target_link_libraries(${shared} PUBLIC ${belowShared} PRIVATE $<BUILD_INTERFACE:${below}>)
            target_link_options(${shared} PRIVATE LINKER:--exclude-libs,ALL)
        endif()
        set_target_properties(${shared} PROPERTIES OUTPUT_NAME ${name} VERSION ${PROJECT_VERSION}
            SOVERSION ${PROJECT_VERSION_MAJOR} LINKER_LANGUAGE CXX)
        if(UNIX AND NOT APPLE)
            set(names "${PROJECT_SOURCE_DIR}/cmake/exports.map")
            target_link_options(${shared} PRIVATE "LINKER:--version-script=${names}")
            set_target_properties(${shared} PROPERTIES LINK_DEPENDS "${names}")
        endif()
        # Where the system looks by itself, a path of one's own is out of place.
        if(NOT CMAKE_INSTALL_PREFIX STREQUAL "/usr")
            set_target_properties(${shared} PROPERTIES INSTALL_RPATH "$ORIGIN")
        endif()
        list(APPEND kinds ${shared})
    endif()
    foreach(target IN LISTS kinds)
        target_include_directories(${target} PUBLIC
            "$<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/include>"
            "$<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}>")
        target_compile_features(${target} PUBLIC cxx_std_20)
        target_link_libraries(${target} PUBLIC ${arg_PUBLIC} PRIVATE ${arg_PRIVATE})
        set_target_properties(${target} PROPERTIES EXPORT_NAME ${component}
            PELLORIC_PRIVATE_LIBRARIES "${arg_PRIVATE}" PELLORIC_PACKAGES "${arg_PACKAGES}")
    endforeach()
    if(PELLORIC_KIND STREQUAL "shared")
        add_library(Pelloric::${component} ALIAS ${name}_shared)
    else()
        add_library(Pelloric::${component} ALIAS ${name})
    endif()
endfunction()

# pelloric_program(NAME SOURCES sources... LIBRARIES libraries...): an executable of this repository.
function(pelloric_program name)
    cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "SOURCES;LIBRARIES")
    add_executable(${name} ${arg_SOURCES})
    target_include_directories(${name} PRIVATE "${PROJECT_SOURCE_DIR}/src")
    target_link_libraries(${name} PRIVATE ${arg_LIBRARIES} pelloric_warnings)
    pelloric_precompile(${name} ${arg_LIBRARIES})
endfunction()
