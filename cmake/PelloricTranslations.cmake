# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Catalogues of Qt Linguist, compiled into the library or program whose texts they are.

find_package(Qt6 6.4 REQUIRED COMPONENTS LinguistTools) # on Debian: qt6-tools-dev, qt6-l10n-tools

# pelloric_translations(TARGET NAME CATALOGUES...): the catalogues as the resource NAME, whose files
# are :/pelloric/translations/*.qm.
function(pelloric_translations target name)
    set(folder "${CMAKE_CURRENT_BINARY_DIR}/translations")
    file(MAKE_DIRECTORY "${folder}")
    set(entries "")
    set(compiled "")
    foreach(catalogue IN LISTS ARGN)
        cmake_path(ABSOLUTE_PATH catalogue BASE_DIRECTORY "${CMAKE_CURRENT_SOURCE_DIR}")
        cmake_path(GET catalogue STEM stem)
        add_custom_command(OUTPUT "${folder}/${stem}.qm"
            COMMAND Qt6::lrelease -silent "${catalogue}" -qm "${folder}/${stem}.qm"
            DEPENDS "${catalogue}" VERBATIM)
        string(APPEND entries "<file>${stem}.qm</file>")
        list(APPEND compiled "${folder}/${stem}.qm")
    endforeach()
    file(GENERATE OUTPUT "${folder}/${name}.qrc" CONTENT
        "<RCC><qresource prefix=\"/pelloric/translations\">${entries}</qresource></RCC>")
    add_custom_command(OUTPUT "${folder}/${name}.cpp"
        COMMAND Qt6::rcc --name ${name} -o "${folder}/${name}.cpp" "${folder}/${name}.qrc"
        DEPENDS "${folder}/${name}.qrc" ${compiled} VERBATIM)
    target_sources(${target} PRIVATE "${folder}/${name}.cpp")
    set_source_files_properties("${folder}/${name}.cpp" PROPERTIES SKIP_AUTOGEN ON)
endfunction()
