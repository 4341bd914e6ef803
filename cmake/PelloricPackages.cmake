# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Debian packages by `cpack -G DEB`, one for each component of PelloricInstall. They are made of a
# build with shared libraries and the prefix /usr: the preset "package".

set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME pelloric)
set(CPACK_PACKAGE_VENDOR "The Pelloric authors")
set(CPACK_PACKAGE_CONTACT "The Pelloric authors <authors@pelloric.invalid>")
set(CPACK_PACKAGE_VERSION "${PROJECT_VERSION}")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "") # the first line of each description below is its summary
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_STRIP_FILES ON)
set(CPACK_COMPONENTS_ALL runtime development tools designer)
set(CPACK_COMPONENTS_GROUPING ONE_PER_GROUP)
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
set(CPACK_DEBIAN_ENABLE_COMPONENT_DEPENDS OFF)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS "${PROJECT_BINARY_DIR}/src")
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)

set(runtime "libpelloric${PROJECT_VERSION_MAJOR}")
set(same "${runtime} (= ${PROJECT_VERSION})")

set(CPACK_DEBIAN_RUNTIME_PACKAGE_NAME "${runtime}")
set(CPACK_DEBIAN_RUNTIME_PACKAGE_SECTION libs)
set(CPACK_DEBIAN_RUNTIME_PACKAGE_CONTROL_EXTRA "${PROJECT_SOURCE_DIR}/packaging/triggers")
set(CPACK_DEBIAN_RUNTIME_PACKAGE_RECOMMENDS "libqt6sql6-sqlite, fonts-arphic-uming, fonts-dejavu-core")
set(CPACK_COMPONENT_RUNTIME_DESCRIPTION "print preview and printing of grids (libraries)
Pelloric gives programs with a grid on their form a print preview, real
printing, and PDF, PNG and SVG files of the same pages.

This package holds the libraries that such programs run with.")

set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_NAME libpelloric-dev)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_DEPENDS
    "${same}, qt6-base-dev, qt6-declarative-dev, qt6-svg-dev, libcups2-dev, libpng-dev, libuchardet-dev, libzip-dev")
set(CPACK_COMPONENT_DEVELOPMENT_DESCRIPTION "print preview and printing of grids (development files)
Pelloric gives programs with a grid on their form a print preview, real
printing, and PDF, PNG and SVG files of the same pages.

This package holds the headers, and the package that CMake finds.")

set(CPACK_DEBIAN_TOOLS_PACKAGE_NAME pelloric)
set(CPACK_DEBIAN_TOOLS_PACKAGE_SECTION utils)
set(CPACK_DEBIAN_TOOLS_PACKAGE_DEPENDS libqt6sql6-sqlite)
set(CPACK_DEBIAN_TOOLS_PACKAGE_RECOMMENDS "fonts-arphic-uming")
set(CPACK_COMPONENT_TOOLS_DESCRIPTION "previews, exports and prints tables
The program pelloric lays out CSV, TSV and JSON files, office sheets and
tables of SQLite databases into pages, and shows, prints or saves them as
PDF, PNG or SVG.")

set(CPACK_DEBIAN_DESIGNER_PACKAGE_NAME pelloric-designer)
set(CPACK_DEBIAN_DESIGNER_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_DESIGNER_PACKAGE_DEPENDS "${same}")
set(CPACK_DEBIAN_DESIGNER_PACKAGE_ENHANCES designer-qt6)
set(CPACK_COMPONENT_DESIGNER_DESCRIPTION "Qt Designer plugin of the Pelloric controls
With this plugin the two controls of Pelloric, the preview facade and the
page canvas, stand in the widget box of Qt Designer.")

# Each package tells its licence and what has changed, as Debian asks.
find_program(GZIP gzip)
if(GZIP)
    set(changelog "${PROJECT_BINARY_DIR}/changelog.gz")
    execute_process(COMMAND "${GZIP}" -9nc "${PROJECT_SOURCE_DIR}/packaging/changelog"
        OUTPUT_FILE "${changelog}")
    foreach(part IN ITEMS runtime development tools designer)
        string(TOUPPER ${part} PART)
        set(docs "${CMAKE_INSTALL_DATADIR}/doc/${CPACK_DEBIAN_${PART}_PACKAGE_NAME}")
        install(FILES "${PROJECT_SOURCE_DIR}/packaging/copyright" DESTINATION "${docs}" COMPONENT ${part})
        install(FILES "${changelog}" DESTINATION "${docs}" COMPONENT ${part})
    endforeach()
endif()

include(CPack)
