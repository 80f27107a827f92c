# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

include(GenerateExportHeader)
include(VelPkgConfig)

# vel_add_platform_library(<name> [QT] DESCRIPTION <text> [REQUIRES <pkg-config module>...]
#                          HEADERS <file>... SOURCES <file>... [PUBLIC <target>...] [PRIVATE <target>...])
#
# A shared library of the bundled platform, its alias Vel::<name>, its export header
# <name>/<name>_export.h, and the rules that install it with a pkg-config file.
# Public headers lie in include/<name>/, so that nobody outside can reach the private ones.
#   QT  it needs Qt: outside of the build tree it is called <name>${VEL_QT_SUFFIX}. What does not
#       is the same library whatever Qt the tree is built with.
function(vel_add_platform_library name)
    cmake_parse_arguments(ARG "QT" "DESCRIPTION" "REQUIRES;HEADERS;SOURCES;PUBLIC;PRIVATE" ${ARGN})
    set(library_name ${name})
    set(header_dir "${CMAKE_INSTALL_INCLUDEDIR}")
    set(export VelCoreTargets)
    if(ARG_QT)
        set(library_name ${name}${VEL_QT_SUFFIX})
        set(export VelPlatformTargets)
        if(VEL_QT_SUFFIX)
            string(APPEND header_dir "/${library_name}")
        endif()
    endif()

    list(TRANSFORM ARG_HEADERS PREPEND "include/${name}/" OUTPUT_VARIABLE headers)
    add_library(${name} SHARED ${ARG_SOURCES} ${headers})
    add_library(Vel::${name} ALIAS ${name})
    if(NOT library_name STREQUAL name)
        add_library(Vel::${library_name} ALIAS ${name})
    endif()
    vel_compile_settings(${name})
    vel_link_settings(${name})

    set(export_header "${CMAKE_CURRENT_BINARY_DIR}/include/${name}/${name}_export.h")
    generate_export_header(${name} EXPORT_FILE_NAME "${export_header}")

    target_include_directories(${name}
        PUBLIC
            "$<BUILD_INTERFACE:${CMAKE_CURRENT_SOURCE_DIR}/include>"
            "$<BUILD_INTERFACE:${CMAKE_CURRENT_BINARY_DIR}/include>"
            "$<INSTALL_INTERFACE:${header_dir}>"
        PRIVATE "${CMAKE_CURRENT_SOURCE_DIR}")
    target_link_libraries(${name} PUBLIC ${ARG_PUBLIC} PRIVATE ${ARG_PRIVATE})
    set_target_properties(${name} PROPERTIES
        EXPORT_NAME ${library_name}
        OUTPUT_NAME ${library_name}
        VERSION ${PROJECT_VERSION}
        SOVERSION ${PROJECT_VERSION_MAJOR})

    vel_set_install_rpath(${name} "${CMAKE_INSTALL_LIBDIR}")
    install(TARGETS ${name} EXPORT ${export}
        LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT platform NAMELINK_COMPONENT platform-devel)
    install(FILES ${headers} "${export_header}"
        DESTINATION ${header_dir}/${name} COMPONENT platform-devel)

    list(JOIN ARG_REQUIRES " " requires)
    set(library_description "${ARG_DESCRIPTION}")
    vel_install_pkgconfig(${library_name} COMPONENT platform-devel
        TEMPLATE "${PROJECT_SOURCE_DIR}/cmake/platform-library.pc.in")
endfunction()
