# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

include(GenerateExportHeader)
include(VelPkgConfig)

# vel_take_in_archives(<library> <archive>...): a shared library links our archives; a static one has
# their objects, unless a library that came before has them already.
function(vel_take_in_archives library)
    foreach(archive IN LISTS ARGN)
        if(VEL_LIBRARY_TYPE STREQUAL "SHARED")
            target_link_libraries(${library} PRIVATE ${archive})
            continue()
        endif()
        target_include_directories(${library} PRIVATE $<TARGET_PROPERTY:${archive},INTERFACE_INCLUDE_DIRECTORIES>)
        get_property(taken_in GLOBAL PROPERTY VEL_ARCHIVES_TAKEN_IN)
        if(NOT archive IN_LIST taken_in)
            target_sources(${library} PRIVATE $<TARGET_OBJECTS:${archive}>)
            set_property(GLOBAL APPEND PROPERTY VEL_ARCHIVES_TAKEN_IN ${archive})
        endif()
    endforeach()
endfunction()

# vel_add_platform_library(<name> [QT] DESCRIPTION <text> [REQUIRES <pkg-config module>...]
#                          HEADERS <file>... SOURCES <file>... [PUBLIC <target>...] [PRIVATE <target>...]
#                          [ARCHIVES <target>...] [STATIC_REQUIRES <pkg-config module>...] [STATIC_LIBS <flag>...])
#
# A library of the bundled platform, its alias Vel::<name>, its export header
# <name>/<name>_export.h, and the rules that install it with a pkg-config file.
#   ARCHIVES  archives of ours that become a part of it
#   STATIC_REQUIRES, STATIC_LIBS
#                    what a program that links it statically has to link as well: ours, and the others, which
#                    stay shared
# Public headers lie in include/<name>/, so that nobody outside can reach the private ones.
#   QT  it needs Qt: outside of the build tree it is called <name>${VEL_QT_SUFFIX}. What does not
#       is the same library whatever Qt the tree is built with.
function(vel_add_platform_library name)
    cmake_parse_arguments(ARG "QT" "DESCRIPTION" "REQUIRES;STATIC_REQUIRES;STATIC_LIBS;HEADERS;SOURCES;PUBLIC;PRIVATE;ARCHIVES" ${ARGN})
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
    add_library(${name} ${VEL_LIBRARY_TYPE} ${ARG_SOURCES} ${headers})
    add_library(Vel::${name} ALIAS ${name})
    if(NOT library_name STREQUAL name)
        add_library(Vel::${library_name} ALIAS ${name})
    endif()
    vel_compile_settings(${name})
    vel_link_settings(${name})

    set(export_header "${CMAKE_CURRENT_BINARY_DIR}/include/${name}/${name}_export.h")
    generate_export_header(${name} EXPORT_FILE_NAME "${export_header}")

    string(TOUPPER "${name}_STATIC_DEFINE" static_define)
    if(VEL_LIBRARY_TYPE STREQUAL "STATIC")
        target_compile_definitions(${name} PUBLIC ${static_define})
    endif()

    target_include_directories(${name}
        PUBLIC
            "$<BUILD_INTERFACE:${CMAKE_CURRENT_SOURCE_DIR}/include>"
            "$<BUILD_INTERFACE:${CMAKE_CURRENT_BINARY_DIR}/include>"
            "$<INSTALL_INTERFACE:${header_dir}>"
        PRIVATE "${CMAKE_CURRENT_SOURCE_DIR}")
    target_link_libraries(${name} PUBLIC ${ARG_PUBLIC} PRIVATE ${ARG_PRIVATE})
    vel_take_in_archives(${name} ${ARG_ARCHIVES})
    set_target_properties(${name} PROPERTIES
        EXPORT_NAME ${library_name}
        OUTPUT_NAME ${library_name}
        VERSION ${PROJECT_VERSION}
        SOVERSION ${PROJECT_VERSION_MAJOR})

    vel_set_install_rpath(${name} "${CMAKE_INSTALL_LIBDIR}")
    install(TARGETS ${name} EXPORT ${export}
        LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT platform NAMELINK_COMPONENT platform-devel
        ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT platform-devel)
    install(FILES ${headers} "${export_header}"
        DESTINATION ${header_dir}/${name} COMPONENT platform-devel)

    list(JOIN ARG_REQUIRES " " requires)
    set(private_requires)
    set(private_libs)
    set(flags)
    if(VEL_LIBRARY_TYPE STREQUAL "STATIC")
        list(TRANSFORM CMAKE_DL_LIBS PREPEND "-l")
        list(JOIN ARG_STATIC_LIBS " " private_libs)
        string(APPEND private_libs " ${CMAKE_DL_LIBS}")
        list(JOIN ARG_STATIC_REQUIRES " " private_requires)
        set(flags "-D${static_define}")
    endif()
    set(library_description "${ARG_DESCRIPTION}")
    vel_install_pkgconfig(${library_name} COMPONENT platform-devel
        TEMPLATE "${PROJECT_SOURCE_DIR}/cmake/platform-library.pc.in")
endfunction()
