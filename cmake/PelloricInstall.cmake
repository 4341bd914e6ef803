# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# What `cmake --install` lays down: headers, libraries, the program and the package for find_package.

include(CMakePackageConfigHelpers)
set(PELLORIC_PACKAGE_DIR "${CMAKE_INSTALL_LIBDIR}/cmake/Pelloric")

install(TARGETS pelloric_core EXPORT PelloricTargets)
install(DIRECTORY "${PROJECT_SOURCE_DIR}/src/" DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}/pelloric"
    FILES_MATCHING PATTERN "*.h" PATTERN "qt" EXCLUDE)

if(TARGET pelloric)
    install(TARGETS pelloric EXPORT PelloricTargets)
    foreach(room IN ITEMS platform grids tables print export controls ui script)
        install(DIRECTORY "${PROJECT_SOURCE_DIR}/src/${room}/qt/"
            DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}/pelloric/${room}/qt"
            FILES_MATCHING PATTERN "*.h")
    endforeach()
    install(FILES "${PROJECT_SOURCE_DIR}/cmake/FindLibCsv.cmake" DESTINATION "${PELLORIC_PACKAGE_DIR}")
endif()
if(TARGET pelloric_app)
    install(TARGETS pelloric_app)
    install(DIRECTORY "${PROJECT_SOURCE_DIR}/samples/" DESTINATION "${CMAKE_INSTALL_DATADIR}/pelloric/samples"
        FILES_MATCHING PATTERN "*.csv" PATTERN "*.tsv" PATTERN "*.sqlite" PATTERN "README.md")
endif()

configure_package_config_file("${PROJECT_SOURCE_DIR}/cmake/PelloricConfig.cmake.in"
    "${PROJECT_BINARY_DIR}/PelloricConfig.cmake" INSTALL_DESTINATION "${PELLORIC_PACKAGE_DIR}")
write_basic_package_version_file("${PROJECT_BINARY_DIR}/PelloricConfigVersion.cmake"
    COMPATIBILITY SameMajorVersion)
install(FILES "${PROJECT_BINARY_DIR}/PelloricConfig.cmake"
    "${PROJECT_BINARY_DIR}/PelloricConfigVersion.cmake" DESTINATION "${PELLORIC_PACKAGE_DIR}")
install(EXPORT PelloricTargets NAMESPACE Pelloric:: DESTINATION "${PELLORIC_PACKAGE_DIR}")
