# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

# The library as a part of the host, of which nothing changes by that.

set(settings
    BUILD_SHARED_LIBS BUILD_TESTING CMAKE_ARCHIVE_OUTPUT_DIRECTORY CMAKE_AUTOMOC CMAKE_BUILD_TYPE
    CMAKE_CXX_COMPILER_LAUNCHER CMAKE_CXX_EXTENSIONS CMAKE_CXX_FLAGS CMAKE_CXX_STANDARD
    CMAKE_CXX_STANDARD_REQUIRED CMAKE_CXX_VISIBILITY_PRESET CMAKE_EXPORT_COMPILE_COMMANDS
    CMAKE_INSTALL_PREFIX CMAKE_INSTALL_RPATH CMAKE_LIBRARY_OUTPUT_DIRECTORY CMAKE_MODULE_PATH
    CMAKE_POSITION_INDEPENDENT_CODE CMAKE_RUNTIME_OUTPUT_DIRECTORY CMAKE_VISIBILITY_INLINES_HIDDEN)
foreach(setting IN LISTS settings)
    set(before_${setting} "${${setting}}")
endforeach()

add_subdirectory("${HOST_PART}" veluiextra)

foreach(setting IN LISTS settings)
    if(NOT "${${setting}}" STREQUAL "${before_${setting}}")
        message(SEND_ERROR "${setting} was \"${before_${setting}}\" and is \"${${setting}}\"")
    endif()
endforeach()
foreach(property IN ITEMS COMPILE_DEFINITIONS COMPILE_OPTIONS INCLUDE_DIRECTORIES LINK_OPTIONS TESTS)
    get_directory_property(value ${property})
    if(value)
        message(SEND_ERROR "the folder has ${property}: ${value}")
    endif()
endforeach()

# check_part(<folder>): nothing is there but libraries, and no test.
function(check_part folder)
    get_property(targets DIRECTORY "${folder}" PROPERTY BUILDSYSTEM_TARGETS)
    foreach(target IN LISTS targets)
        get_target_property(type ${target} TYPE)
        if(type MATCHES "EXECUTABLE|MODULE_LIBRARY")
            message(SEND_ERROR "${target} is built within another project")
        endif()
        get_target_property(launcher ${target} CXX_COMPILER_LAUNCHER)
        if(launcher AND NOT CMAKE_CXX_COMPILER_LAUNCHER)
            message(SEND_ERROR "${target} is compiled through ${launcher}")
        endif()
    endforeach()
    get_property(tests DIRECTORY "${folder}" PROPERTY TESTS)
    if(tests)
        message(SEND_ERROR "there are tests within another project: ${tests}")
    endif()
    get_property(subfolders DIRECTORY "${folder}" PROPERTY SUBDIRECTORIES)
    foreach(subfolder IN LISTS subfolders)
        check_part("${subfolder}")
    endforeach()
endfunction()
check_part("${HOST_PART}")
