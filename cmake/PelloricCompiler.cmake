# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# The language, the warnings and the sanitizers of every target below this folder.

set(CMAKE_CXX_STANDARD 20)
set(CMAKE_CXX_STANDARD_REQUIRED ON)
set(CMAKE_CXX_EXTENSIONS OFF)
set(CMAKE_POSITION_INDEPENDENT_CODE ON)

# An embedding project chooses these itself.
if(PROJECT_IS_TOP_LEVEL)
    set(CMAKE_EXPORT_COMPILE_COMMANDS ON)
    if(NOT CMAKE_BUILD_TYPE AND NOT CMAKE_CONFIGURATION_TYPES)
        set(CMAKE_BUILD_TYPE RelWithDebInfo CACHE STRING "The kind of build" FORCE)
    endif()
    if(NOT CMAKE_CXX_COMPILER_LAUNCHER)
        find_program(PELLORIC_CCACHE ccache)
        if(PELLORIC_CCACHE)
            set(CMAKE_CXX_COMPILER_LAUNCHER "${PELLORIC_CCACHE}")
        endif()
    endif()
endif()

if(PELLORIC_SANITIZE)
    add_compile_options(-fsanitize=address,undefined -fno-sanitize-recover=all -fno-omit-frame-pointer)
    add_link_options(-fsanitize=address,undefined)
endif()

if(PELLORIC_BUILD_FUZZERS)
    if(NOT CMAKE_CXX_COMPILER_ID STREQUAL "Clang")
        message(FATAL_ERROR "The fuzzers need clang: configure with the preset 'fuzz'")
    endif()
    add_compile_options(-fsanitize=fuzzer-no-link)
endif()

# Warnings are told to those who work on this project, and are errors in its presets only.
add_library(pelloric_warnings INTERFACE)
if(PROJECT_IS_TOP_LEVEL AND CMAKE_CXX_COMPILER_ID MATCHES "GNU|Clang")
    target_compile_options(pelloric_warnings INTERFACE -Wall -Wextra -Wconversion
        $<$<BOOL:${PELLORIC_WARNINGS_AS_ERRORS}>:-Werror>)
    # g++ 12 warns at -O3 of copies within a text that overlap, where a text is put before another.
    if(CMAKE_CXX_COMPILER_ID STREQUAL "GNU" AND CMAKE_CXX_COMPILER_VERSION VERSION_LESS 13)
        target_compile_options(pelloric_warnings INTERFACE -Wno-restrict)
    endif()
endif()
