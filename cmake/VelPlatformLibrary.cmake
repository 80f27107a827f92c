# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

include(GenerateExportHeader)
include(VelPkgConfig)

# vel_add_platform_library(<name> DESCRIPTION <text> [REQUIRES <pkg-config module>...]
#                          HEADERS <file>... SOURCES <file>... [PUBLIC <target>...] [PRIVATE <target>...])
#
# A shared library of the bundled platform, its alias Vel::<name>, its export header
# <name>/<name>_export.h, and the rules that install it with a pkg-config file.
# Public headers lie in include/<name>/, so that nobody outside can reach the private ones.
function(vel_add_platform_library name)
    cmake_parse_arguments(ARG "" "DESCRIPTION" "REQUIRES;HEADERS;SOURCES;PUBLIC;PRIVATE" ${ARGN})
    list(TRANSFORM ARG_HEADERS PREPEND "include/${name}/" OUTPUT_VARIABLE headers)
    add_library(${name} SHARED ${ARG_SOURCES} ${headers})
    add_library(Vel::${name} ALIAS ${name})
    vel_compile_settings(${name})
    vel_link_settings(${name})

    set(export_header "${CMAKE_CURRENT_BINARY_DIR}/include/${name}/${name}_export.h")
    generate_export_header(${name} EXPORT_FILE_NAME "${export_header}")

    target_include_directories(${name}
        PUBLIC
            "$<BUILD_INTERFACE:${CMAKE_CURRENT_SOURCE_DIR}/include>"
            "$<BUILD_INTERFACE:${CMAKE_CURRENT_BINARY_DIR}/include>"
            "$<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}>"
        PRIVATE "${CMAKE_CURRENT_SOURCE_DIR}")
    target_link_libraries(${name} PUBLIC ${ARG_PUBLIC} PRIVATE ${ARG_PRIVATE})
    set_target_properties(${name} PROPERTIES VERSION ${PROJECT_VERSION} SOVERSION ${PROJECT_VERSION_MAJOR})

    install(TARGETS ${name} EXPORT VelPlatformTargets
        LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT platform NAMELINK_COMPONENT platform-devel)
    install(FILES ${headers} "${export_header}"
        DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/${name} COMPONENT platform-devel)

    list(JOIN ARG_REQUIRES " " requires)
    set(library_name ${name})
    set(library_description "${ARG_DESCRIPTION}")
    vel_install_pkgconfig(${name} COMPONENT platform-devel
        TEMPLATE "${PROJECT_SOURCE_DIR}/cmake/platform-library.pc.in")
endfunction()
