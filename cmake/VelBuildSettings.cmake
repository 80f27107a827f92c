# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

# Options and the settings that all of our own targets share. Within another project only the
# libraries are built, and nothing of that project's changes: what is set here ends with this folder.

# Shared unless somebody says otherwise; what another project leaves open stays open there.
if(PROJECT_IS_TOP_LEVEL)
    option(BUILD_SHARED_LIBS "Build shared libraries; else static ones, without the tests and the plugin" ON)
endif()
if(DEFINED BUILD_SHARED_LIBS AND NOT BUILD_SHARED_LIBS)
    set(VEL_LIBRARY_TYPE STATIC)
    set(with_shared_libraries OFF)
else()
    set(VEL_LIBRARY_TYPE SHARED)
    set(with_shared_libraries ${PROJECT_IS_TOP_LEVEL})
endif()

option(VEL_BUILD_APPS "Build the programs" ${PROJECT_IS_TOP_LEVEL})
option(VEL_BUILD_DESIGNER "Build the plugin for Qt Designer" ${with_shared_libraries})
option(VEL_BUILD_TESTS "Build the tests" ${with_shared_libraries})
option(VEL_BUILD_BENCHMARKS "Build the benchmarks" OFF)
option(VEL_BUILD_FUZZERS "Build the fuzz targets, with clang; the preset \"fuzz\" has the settings for that" OFF)
option(VEL_WARNINGS_AS_ERRORS "Stop at a compiler warning" OFF)
set(VEL_PLATFORM "bundled" CACHE STRING
    "Which platform libraries to use: \"bundled\" builds those under platform/, \"system\" takes installed ones")
set_property(CACHE VEL_PLATFORM PROPERTY STRINGS bundled system)
set(VEL_TRANSLATIONS_DIR "/usr/share/vel/translations" CACHE STRING
    "Directory of the translation catalogs; empty switches the look-up off")
set(VEL_SANITIZE "" CACHE STRING "Sanitizers to build with, for instance \"address,undefined\"")

if(NOT VEL_PLATFORM MATCHES "^(bundled|system)$")
    message(FATAL_ERROR "VEL_PLATFORM is \"${VEL_PLATFORM}\", it has to be \"bundled\" or \"system\"")
endif()

if(VEL_BUILD_TESTS AND NOT (VEL_BUILD_APPS AND VEL_BUILD_DESIGNER))
    message(FATAL_ERROR "VEL_BUILD_TESTS needs VEL_BUILD_APPS and VEL_BUILD_DESIGNER")
endif()
# A plugin with a library of its own would not know the widgets of the program that loads it.
if(VEL_BUILD_DESIGNER AND VEL_LIBRARY_TYPE STREQUAL "STATIC")
    message(FATAL_ERROR "VEL_BUILD_DESIGNER needs shared libraries, BUILD_SHARED_LIBS is off")
endif()

# Another project decides by itself about a compiler cache.
if(PROJECT_IS_TOP_LEVEL)
    find_program(VEL_CCACHE ccache)
    if(VEL_CCACHE AND NOT CMAKE_CXX_COMPILER_LAUNCHER)
        set(CMAKE_CXX_COMPILER_LAUNCHER "${VEL_CCACHE}")
    endif()
    set(CMAKE_EXPORT_COMPILE_COMMANDS ON)
endif()

if(VEL_BUILD_FUZZERS AND NOT (CMAKE_CXX_COMPILER_ID STREQUAL "Clang" AND VEL_PLATFORM STREQUAL "bundled"))
    message(FATAL_ERROR "VEL_BUILD_FUZZERS needs clang and the bundled platform")
endif()

set(CMAKE_CXX_STANDARD 17)
set(CMAKE_CXX_STANDARD_REQUIRED ON)
set(CMAKE_CXX_EXTENSIONS OFF)
set(CMAKE_CXX_VISIBILITY_PRESET hidden)
set(CMAKE_VISIBILITY_INLINES_HIDDEN ON)
set(CMAKE_POSITION_INDEPENDENT_CODE ON)
set(CMAKE_AUTOMOC ON)

# Libraries and programs lie as they are installed: what is run from the build tree finds its neighbors.
set(CMAKE_RUNTIME_OUTPUT_DIRECTORY "${PROJECT_BINARY_DIR}/bin")
get_filename_component(CMAKE_LIBRARY_OUTPUT_DIRECTORY "${PROJECT_BINARY_DIR}/${CMAKE_INSTALL_LIBDIR}" ABSOLUTE)
set(CMAKE_ARCHIVE_OUTPUT_DIRECTORY "${PROJECT_BINARY_DIR}/lib")

if(VEL_SANITIZE)
    add_compile_options("-fsanitize=${VEL_SANITIZE}" -fno-omit-frame-pointer)
    if(VEL_SANITIZE MATCHES "undefined")
        add_compile_options(-fno-sanitize-recover=undefined)
    endif()
    add_link_options("-fsanitize=${VEL_SANITIZE}")
endif()

# vel_compile_settings(<target>): the warnings and definitions of our own code.
function(vel_compile_settings target)
    target_compile_options(${target} PRIVATE
        -Wall -Wextra -Wpedantic -Wshadow -Wnon-virtual-dtor -Woverloaded-virtual
        # The sizes of Qt 6 have 64 bits, and ours are those of both: a build with Qt 5 tells.
        $<IF:$<EQUAL:${VEL_QT_MAJOR},5>,-Wconversion,-Wno-conversion>
        $<$<CXX_COMPILER_ID:GNU>:-Wsuggest-override>
        # Every qCDebug trips over this one in clang 14.
        $<$<CXX_COMPILER_ID:Clang>:-Wno-gnu-zero-variadic-macro-arguments>
        $<$<BOOL:${VEL_WARNINGS_AS_ERRORS}>:-Werror>)
    target_compile_definitions(${target} PRIVATE
        QT_NO_KEYWORDS
        QT_NO_CAST_FROM_ASCII
        QT_NO_CAST_TO_ASCII
        QT_NO_URL_CAST_FROM_STRING
        QT_NO_FOREACH
        QT_NO_NARROWING_CONVERSIONS_IN_CONNECT
        QT_STRICT_ITERATORS
        QT_DISABLE_DEPRECATED_BEFORE=0x050F00
        # What the oldest Qt 6 has no other name for is no matter for a warning of a later one.
        $<$<EQUAL:${VEL_QT_MAJOR},6>:QT_DEPRECATED_WARNINGS_SINCE=0x060400>)
endfunction()

# vel_link_settings(<target>): a shared library has to name all that it needs.
function(vel_link_settings target)
    if(NOT (VEL_SANITIZE AND CMAKE_CXX_COMPILER_ID STREQUAL "Clang"))
        target_link_options(${target} PRIVATE LINKER:--no-undefined)
    endif()
endfunction()
