# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# What `cmake --install` lays down, in four components: the libraries that programs run with
# (runtime), headers and the package for find_package (development), the program with what desktops
# and shells need of it (tools), and the plugin of Qt Designer (designer).

include(CMakePackageConfigHelpers)
set(PELLORIC_PACKAGE_DIR "${CMAKE_INSTALL_LIBDIR}/cmake/Pelloric")

# What programs load at run time is one component, what they are linked with another.
function(pelloric_install_library name)
    install(TARGETS ${name} EXPORT PelloricTargets
        LIBRARY COMPONENT runtime NAMELINK_COMPONENT development
        ARCHIVE COMPONENT development
        RUNTIME COMPONENT runtime)
endfunction()

set(CMAKE_INSTALL_DEFAULT_COMPONENT_NAME development)
pelloric_install_library(pelloric_core)
install(DIRECTORY "${PROJECT_SOURCE_DIR}/src/" DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}/pelloric"
    FILES_MATCHING PATTERN "*.h" PATTERN "qt" EXCLUDE)

if(TARGET pelloric)
    pelloric_install_library(pelloric)
    foreach(room IN ITEMS platform grids tables print export controls ui script)
        install(DIRECTORY "${PROJECT_SOURCE_DIR}/src/${room}/qt/"
            DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}/pelloric/${room}/qt"
            FILES_MATCHING PATTERN "*.h")
    endforeach()
    install(FILES "${PROJECT_SOURCE_DIR}/cmake/FindHarfBuzzSubset.cmake"
        "${PROJECT_SOURCE_DIR}/cmake/FindLibDeflate.cmake"
        "${PROJECT_SOURCE_DIR}/cmake/FindLibZip.cmake"
        "${PROJECT_SOURCE_DIR}/cmake/FindUchardet.cmake" DESTINATION "${PELLORIC_PACKAGE_DIR}")
endif()
if(TARGET pelloric_app)
    install(TARGETS pelloric_app COMPONENT tools)
    install(DIRECTORY "${PROJECT_SOURCE_DIR}/samples/" DESTINATION "${CMAKE_INSTALL_DATADIR}/pelloric/samples"
        COMPONENT tools FILES_MATCHING PATTERN "*.csv" PATTERN "*.tsv" PATTERN "*.sqlite" PATTERN "README.md")
endif()

if(TARGET pelloric_app AND UNIX AND NOT APPLE)
    # Manual page and completions are what the program itself says.
    set(manual "${PROJECT_BINARY_DIR}/manual")
    file(MAKE_DIRECTORY "${manual}")
    add_custom_command(OUTPUT "${manual}/pelloric.1" "${manual}/pelloric.bash" "${manual}/_pelloric"
            "${manual}/pelloric.fish"
        COMMAND pelloric_app help --man > "${manual}/pelloric.1"
        COMMAND pelloric_app completion bash > "${manual}/pelloric.bash"
        COMMAND pelloric_app completion zsh > "${manual}/_pelloric"
        COMMAND pelloric_app completion fish > "${manual}/pelloric.fish"
        DEPENDS pelloric_app VERBATIM)
    add_custom_target(pelloric_manual ALL DEPENDS "${manual}/pelloric.1")
    install(FILES "${manual}/pelloric.1" DESTINATION "${CMAKE_INSTALL_MANDIR}/man1" COMPONENT tools)
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

configure_package_config_file("${PROJECT_SOURCE_DIR}/cmake/PelloricConfig.cmake.in"
    "${PROJECT_BINARY_DIR}/PelloricConfig.cmake" INSTALL_DESTINATION "${PELLORIC_PACKAGE_DIR}")
write_basic_package_version_file("${PROJECT_BINARY_DIR}/PelloricConfigVersion.cmake"
    COMPATIBILITY SameMajorVersion)
install(FILES "${PROJECT_BINARY_DIR}/PelloricConfig.cmake"
    "${PROJECT_BINARY_DIR}/PelloricConfigVersion.cmake" DESTINATION "${PELLORIC_PACKAGE_DIR}")
install(EXPORT PelloricTargets NAMESPACE Pelloric:: DESTINATION "${PELLORIC_PACKAGE_DIR}")
