# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# What `cmake --install` lays down, in four components: the libraries that programs run with
# (runtime), headers and the packages that find_package and pkg-config read (development), the
# program with what desktops and shells need of it (tools), and the plugin of Qt Designer (designer).
# The package finds everything from where it lies itself, so that the whole may be moved. The kind of
# library that was not chosen is laid down only where it is asked for by --component static or shared,
# as the tests do.

include(CMakePackageConfigHelpers)
set(PELLORIC_PACKAGE_DIR "${CMAKE_INSTALL_LIBDIR}/cmake/Pelloric")

# pelloric_dependencies(TARGET RESULT): lines that find what a static library of the target needs.
function(pelloric_dependencies target result)
    set(lines "")
    if(TARGET ${target})
        get_target_property(packages ${target} PELLORIC_PACKAGES)
        get_target_property(private ${target} PELLORIC_PRIVATE_LIBRARIES)
        foreach(item IN LISTS private)
            if(item MATCHES "^Qt6::(.*)$")
                string(APPEND lines "    find_dependency(Qt6 6.4 COMPONENTS ${CMAKE_MATCH_1})\n")
            endif()
        endforeach()
        foreach(package IN LISTS packages)
            string(APPEND lines "    find_dependency(${package})\n")
        endforeach()
    endif()
    set(${result} "${lines}" PARENT_SCOPE)
endfunction()

# pelloric_package(KIND): rules for the libraries of a kind.
function(pelloric_package kind)
    set(runtime runtime)
    set(development development)
    set(excluded "")
    if(NOT kind STREQUAL PELLORIC_KIND)
        set(runtime ${kind})
        set(development ${kind})
        set(excluded EXCLUDE_FROM_ALL)
    endif()
    foreach(component IN ITEMS core widgets tables script)
        set(target pelloric_${component})
        if(component STREQUAL "widgets")
            set(target pelloric)
        endif()
        set(name pelloric-${component})
        if(kind STREQUAL "shared")
            string(APPEND target _shared)
        endif()
        if(NOT TARGET ${target})
            continue()
        endif()
        install(TARGETS ${target} EXPORT Pelloric-${component}-${kind}
            LIBRARY COMPONENT ${runtime} NAMELINK_COMPONENT ${development} ${excluded}
            ARCHIVE COMPONENT ${development} ${excluded}
            RUNTIME COMPONENT ${runtime} ${excluded})
        install(EXPORT Pelloric-${component}-${kind} FILE Pelloric-${component}-${kind}.cmake
            NAMESPACE Pelloric:: DESTINATION "${PELLORIC_PACKAGE_DIR}"
            COMPONENT ${development} ${excluded})
        pelloric_pkg_config(${component} ${kind})
        install(FILES "${PROJECT_BINARY_DIR}/${kind}/${name}.pc"
            DESTINATION "${CMAKE_INSTALL_LIBDIR}/pkgconfig" COMPONENT ${development} ${excluded})
    endforeach()
    install(DIRECTORY "${PROJECT_SOURCE_DIR}/include/pelloric"
        DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}" COMPONENT ${development} ${excluded})
    set(PELLORIC_INSTALLED_KIND ${kind})
    set(PELLORIC_STATIC OFF)
    if(kind STREQUAL "static")
        set(PELLORIC_STATIC ON)
    endif()
    pelloric_dependencies(pelloric PELLORIC_WIDGETS_DEPENDENCIES)
    pelloric_dependencies(pelloric_tables PELLORIC_TABLES_DEPENDENCIES)
    configure_package_config_file("${PROJECT_SOURCE_DIR}/cmake/PelloricConfig.cmake.in"
        "${PROJECT_BINARY_DIR}/${kind}/PelloricConfig.cmake"
        INSTALL_DESTINATION "${PELLORIC_PACKAGE_DIR}")
    file(GLOB finders "${PROJECT_SOURCE_DIR}/cmake/Find*.cmake")
    install(FILES "${PROJECT_BINARY_DIR}/${kind}/PelloricConfig.cmake"
        "${PROJECT_BINARY_DIR}/PelloricConfigVersion.cmake"
        ${finders}
        DESTINATION "${PELLORIC_PACKAGE_DIR}" COMPONENT ${development} ${excluded})
endfunction()

# pelloric_link_options(TARGET RESULT): " -lpng -lz" for a target of a system's library.
function(pelloric_link_options target result)
    get_target_property(files ${target} IMPORTED_LOCATION)
    get_target_property(others ${target} INTERFACE_LINK_LIBRARIES)
    set(options "")
    foreach(file IN LISTS files others)
        if(TARGET "${file}")
            pelloric_link_options(${file} more)
            string(APPEND options "${more}")
        elseif(file MATCHES "/lib([^/]+)\\.(so|a|dylib)$")
            string(APPEND options " -l${CMAKE_MATCH_1}")
        endif()
    endforeach()
    set(${result} "${options}" PARENT_SCOPE)
endfunction()

# What a component's pkg-config file names, by component: what it builds on, and in a static library
# what the host's linker needs besides.
set(PELLORIC_PC_core_requires "")
set(PELLORIC_PC_widgets_requires "Qt6Widgets Qt6PrintSupport")
set(PELLORIC_PC_tables_requires "pelloric-widgets")
set(PELLORIC_PC_script_requires "pelloric-widgets Qt6Qml")

# pelloric_pkg_config(COMPONENT KIND): writes pelloric-COMPONENT.pc.
function(pelloric_pkg_config component kind)
    set(library pelloric_${component})
    if(component STREQUAL "widgets")
        set(library pelloric)
    endif()
    set(requires "${PELLORIC_PC_${component}_requires}")
    set(libs "-L\${libdir} -l${library}")
    if(kind STREQUAL "static")
        get_target_property(private ${library} PELLORIC_PRIVATE_LIBRARIES)
        if(component STREQUAL "widgets")
            string(APPEND libs " -lpelloric_core")
        endif()
        foreach(item IN LISTS private)
            if(item MATCHES "^Qt6::(.*)$")
                string(APPEND requires " Qt6${CMAKE_MATCH_1}")
            elseif(TARGET ${item})
                pelloric_link_options(${item} options)
                string(APPEND libs "${options}")
            endif()
        endforeach()
    endif()
    string(STRIP "${requires}" requires)
    file(RELATIVE_PATH up "/${CMAKE_INSTALL_LIBDIR}/pkgconfig" "/")
    file(CONFIGURE OUTPUT "${PROJECT_BINARY_DIR}/${kind}/pelloric-${component}.pc" CONTENT
"prefix=\${pcfiledir}/${up}
libdir=\${prefix}/${CMAKE_INSTALL_LIBDIR}
includedir=\${prefix}/${CMAKE_INSTALL_INCLUDEDIR}

Name: Pelloric ${component}
Description: ${PROJECT_DESCRIPTION}
Version: ${PROJECT_VERSION}
Requires: ${requires}
Cflags: -I\${includedir} -std=c++20
Libs: ${libs}
" @ONLY)
endfunction()

write_basic_package_version_file("${PROJECT_BINARY_DIR}/PelloricConfigVersion.cmake"
    COMPATIBILITY SameMajorVersion)
foreach(kind IN LISTS PELLORIC_KINDS)
    pelloric_package(${kind})
endforeach()

if(TARGET pelloric_app)
    install(TARGETS pelloric_app COMPONENT tools)
    install(DIRECTORY "${PROJECT_SOURCE_DIR}/samples/" DESTINATION "${CMAKE_INSTALL_DATADIR}/pelloric/samples"
        COMPONENT tools FILES_MATCHING PATTERN "*.csv" PATTERN "*.tsv" PATTERN "*.sqlite" PATTERN "README.md")
endif()

if(TARGET pelloric_app AND UNIX AND NOT APPLE)
    # Manual page and completions are what the program itself says.
    set(manual "${PROJECT_BINARY_DIR}/manual")
    set(english "${CMAKE_COMMAND}" -E env LC_ALL=C.UTF-8 LANGUAGE= "$<TARGET_FILE:pelloric_app>")
    file(MAKE_DIRECTORY "${manual}")
    add_custom_command(OUTPUT "${manual}/pelloric.1" "${manual}/pelloric.bash" "${manual}/_pelloric"
            "${manual}/pelloric.fish"
        COMMAND ${english} help --man > "${manual}/pelloric.1"
        COMMAND ${english} completion bash > "${manual}/pelloric.bash"
        COMMAND ${english} completion zsh > "${manual}/_pelloric"
        COMMAND ${english} completion fish > "${manual}/pelloric.fish"
        DEPENDS pelloric_app VERBATIM)
    set(page "${manual}/pelloric.1")
    find_program(GZIP gzip)
    if(GZIP)
        add_custom_command(OUTPUT "${page}.gz" COMMAND "${GZIP}" -9nkf "${page}" DEPENDS "${page}" VERBATIM)
        string(APPEND page ".gz")
    endif()
    add_custom_target(pelloric_manual ALL DEPENDS "${page}")
    install(FILES "${page}" DESTINATION "${CMAKE_INSTALL_MANDIR}/man1" COMPONENT tools)
    install(FILES "${manual}/pelloric.bash" RENAME pelloric COMPONENT tools
        DESTINATION "${CMAKE_INSTALL_DATADIR}/bash-completion/completions")
    install(FILES "${manual}/_pelloric" COMPONENT tools
        DESTINATION "${CMAKE_INSTALL_DATADIR}/zsh/vendor-completions")
    install(FILES "${manual}/pelloric.fish" COMPONENT tools
        DESTINATION "${CMAKE_INSTALL_DATADIR}/fish/vendor_completions.d")
    install(FILES "${PROJECT_SOURCE_DIR}/packaging/pelloric.desktop"
        "${PROJECT_SOURCE_DIR}/packaging/pelloric-demo.desktop"
        DESTINATION "${CMAKE_INSTALL_DATADIR}/applications" COMPONENT tools)
    install(FILES "${PROJECT_SOURCE_DIR}/packaging/pelloric.svg"
        DESTINATION "${CMAKE_INSTALL_DATADIR}/icons/hicolor/scalable/apps" COMPONENT tools)
    install(FILES "${PROJECT_SOURCE_DIR}/packaging/pelloric.xml"
        DESTINATION "${CMAKE_INSTALL_DATADIR}/mime/packages" COMPONENT tools)
endif()
if(TARGET pelloric_designer)
    install(TARGETS pelloric_designer COMPONENT designer
        LIBRARY DESTINATION "${CMAKE_INSTALL_LIBDIR}/qt6/plugins/designer")
endif()

# `cmake --build BUILD --target uninstall` takes away what the last install laid down.
if(NOT TARGET uninstall)
    add_custom_target(uninstall VERBATIM
        COMMAND "${CMAKE_COMMAND}" -DMANIFESTS=${PROJECT_BINARY_DIR}
            -P "${PROJECT_SOURCE_DIR}/cmake/Uninstall.cmake")
endif()
