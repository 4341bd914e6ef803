# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Headers of others, compiled once for all sources of a kind: with clang a whole build then takes a
# third of the time. Off unless asked for, because sources that forget an include compile with them.

set(PELLORIC_STD_HEADERS <algorithm> <array> <atomic> <bit> <charconv> <chrono> <cmath>
    <condition_variable> <cstddef> <cstdint> <cstdio> <cstdlib> <cstring> <deque> <exception>
    <filesystem> <fstream> <functional> <iomanip> <iostream> <iterator> <limits> <list> <map> <memory>
    <mutex> <numeric> <optional> <ostream> <ranges> <regex> <set> <span> <sstream> <stdexcept> <string>
    <string_view> <system_error> <thread> <tuple> <type_traits> <unordered_map> <unordered_set>
    <utility> <variant> <vector>)
set(PELLORIC_QT_HEADERS <QtCore/QtCore> <QtGui/QtGui> <QtWidgets/QtWidgets>
    <QtPrintSupport/QtPrintSupport>)
set(PELLORIC_QT_LIBRARIES Qt6::Core Qt6::Gui Qt6::Widgets Qt6::PrintSupport)

# pelloric_headers(KIND LIBRARIES libraries... HEADERS headers...): a target that holds the compiled
# headers of a kind; made when the first target of the kind wants it.
function(pelloric_headers kind)
    cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "LIBRARIES;HEADERS")
    set(name pelloric_headers_${kind})
    if(NOT TARGET ${name})
        set(source "${PROJECT_BINARY_DIR}/${name}.cpp")
        file(CONFIGURE OUTPUT "${source}" CONTENT "")
        add_library(${name} OBJECT "${source}")
        set_target_properties(${name} PROPERTIES AUTOMOC OFF AUTORCC OFF)
        target_link_libraries(${name} PRIVATE ${arg_LIBRARIES})
        target_precompile_headers(${name} PRIVATE ${arg_HEADERS})
    endif()
endfunction()

# pelloric_precompile(TARGET libraries...): lets a target that links the libraries use the headers of
# its kind.
function(pelloric_precompile target)
    if(NOT PELLORIC_PRECOMPILED_HEADERS)
        return()
    endif()
    set(kind std)
    set(libraries "")
    set(headers ${PELLORIC_STD_HEADERS})
    if("${ARGN}" MATCHES "Pelloric::|Qt6::")
        set(kind qt)
        list(APPEND libraries ${PELLORIC_QT_LIBRARIES})
        list(APPEND headers ${PELLORIC_QT_HEADERS})
    endif()
    if("${ARGN}" MATCHES "GTest::")
        string(APPEND kind _test)
        list(APPEND libraries GTest::gmock GTest::gtest)
        list(APPEND headers <gtest/gtest.h> <gmock/gmock.h>)
    endif()
    pelloric_headers(${kind} LIBRARIES ${libraries} HEADERS ${headers})
    target_precompile_headers(${target} REUSE_FROM pelloric_headers_${kind})
endfunction()

if(PELLORIC_PRECOMPILED_HEADERS)
    # One header serves libraries and programs, so both are compiled alike.
    set(CMAKE_CXX_COMPILE_OPTIONS_PIE "${CMAKE_CXX_COMPILE_OPTIONS_PIC}")
    # What ccache has to be told before it looks at such headers at all.
    if(CMAKE_CXX_COMPILER_LAUNCHER MATCHES "ccache" AND CMAKE_CXX_COMPILER_ID STREQUAL "Clang")
        list(PREPEND CMAKE_CXX_COMPILER_LAUNCHER "${CMAKE_COMMAND}" -E env
            CCACHE_SLOPPINESS=pch_defines,time_macros)
        add_compile_options("SHELL:-Xclang -fno-pch-timestamp")
    endif()
endif()
