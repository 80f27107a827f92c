# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

# Which Qt the tree is built with, and what carries the major in its name. Two builds, one of each
# major, are installed into the same prefix:
#
#   VEL_QT_MAJOR   5 or 6
#   VEL_QT         Qt5 or Qt6, the prefix of Qt's own targets: ${VEL_QT}::Widgets
#   VEL_QT_SUFFIX  what ends the names of libraries that use Qt: nothing, or -qt6
#   VEL_OTHER_QT_SUFFIX  the same of the other major
#   VEL_PACKAGE    the CMake package of the library: VelUIExtra or VelUIExtraQt6

# A program that has found its Qt already decides; else 5 where both are there.
if(NOT VEL_QT_MAJOR)
    set(found_qt_major 5)
    if(TARGET Qt6::Core)
        set(found_qt_major 6)
    elseif(NOT TARGET Qt5::Core)
        find_package(Qt5 5.15 QUIET COMPONENTS Core)
        if(NOT Qt5_FOUND)
            find_package(Qt6 6.4 QUIET COMPONENTS Core)
            if(Qt6_FOUND)
                set(found_qt_major 6)
            endif()
        endif()
    endif()
endif()
set(VEL_QT_MAJOR "${found_qt_major}" CACHE STRING "Major version of Qt to build with: 5 or 6")
set_property(CACHE VEL_QT_MAJOR PROPERTY STRINGS 5 6)

if(VEL_QT_MAJOR STREQUAL "5")
    set(VEL_QT_VERSION 5.15)
    set(VEL_QT_SUFFIX "")
    set(VEL_OTHER_QT_SUFFIX "-qt6")
    set(VEL_PACKAGE VelUIExtra)
elseif(VEL_QT_MAJOR STREQUAL "6")
    set(VEL_QT_VERSION 6.4)
    set(VEL_QT_SUFFIX "-qt6")
    set(VEL_OTHER_QT_SUFFIX "")
    set(VEL_PACKAGE VelUIExtraQt6)
else()
    message(FATAL_ERROR "VEL_QT_MAJOR is \"${VEL_QT_MAJOR}\", it has to be 5 or 6")
endif()
set(VEL_QT "Qt${VEL_QT_MAJOR}")

# vel_require(<package> <version> [<component>...]): finds what the chosen Qt needs, or stops and says what is
# missing. A macro, for what Qt tells by variables.
macro(vel_require package version)
    find_package(${package} ${version} QUIET COMPONENTS ${ARGN})
    if(NOT ${package}_FOUND)
        vel_say_what_is_missing(${package} ${version} "${ARGN}" "${${package}_NOT_FOUND_MESSAGE}"
            "${${package}_CONSIDERED_VERSIONS}")
    endif()
endmacro()

function(vel_say_what_is_missing package version components reason versions)
    if(components)
        list(JOIN components ", " components)
        string(PREPEND components ": ")
    endif()
    if(versions AND NOT reason)
        list(REMOVE_DUPLICATES versions)
        list(JOIN versions ", " versions)
        set(reason "There is version ${versions}.")
    endif()
    string(STRIP "${reason}" reason)
    set(group build)
    if(VEL_QT_MAJOR STREQUAL "6")
        set(group build-qt6)
    endif()
    message(FATAL_ERROR "VEL_QT_MAJOR is ${VEL_QT_MAJOR}, and ${package} ${version} or later is missing${components}.\n${reason}\n"
        "Its packages stand in packaging/dependencies under [${group}]; CMAKE_PREFIX_PATH names another place to look in.")
endfunction()

# vel_find_qt(<component>...): modules of the chosen Qt.
macro(vel_find_qt)
    vel_require(${VEL_QT} ${VEL_QT_VERSION} ${ARGN})
endmacro()

# vel_add_translations(<variable> <file>...): compiles catalogs; <variable> names the results.
macro(vel_add_translations)
    cmake_language(CALL qt${VEL_QT_MAJOR}_add_translation ${ARGN})
endmacro()

# vel_add_resources(<variable> <file>): compiles a list of resources; <variable> names the result.
macro(vel_add_resources)
    cmake_language(CALL qt${VEL_QT_MAJOR}_add_resources ${ARGN})
endmacro()

vel_find_qt(Core Gui Widgets DBus)
if(VEL_QT_MAJOR STREQUAL "5")
    vel_find_qt(X11Extras)
    vel_require(KF5IconThemes 5.100)
    vel_require(KF5WindowSystem 5.100)
    set(VEL_QT_LIBRARIES Qt5::Widgets Qt5::DBus Qt5::X11Extras KF5::IconThemes KF5::WindowSystem)
else()
    vel_require(KF6IconThemes 6.0)
    vel_require(KF6WindowSystem 6.0)
    set(VEL_QT_LIBRARIES Qt6::Widgets Qt6::DBus KF6::IconWidgets KF6::WindowSystem)
endif()
