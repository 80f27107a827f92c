# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

# Where things are installed, seen from each other: what was installed together finds its neighbors
# from where it lies itself, so that a prefix may be moved.

file(RELATIVE_PATH VEL_DATA_FROM_LIBRARY "${CMAKE_INSTALL_FULL_LIBDIR}" "${CMAKE_INSTALL_FULL_DATADIR}/vel")
file(RELATIVE_PATH VEL_DATA_FROM_PROGRAM "${CMAKE_INSTALL_FULL_BINDIR}" "${CMAKE_INSTALL_FULL_DATADIR}/vel")
file(RELATIVE_PATH VEL_ICONS_FROM_PROGRAM "${CMAKE_INSTALL_FULL_BINDIR}" "${CMAKE_INSTALL_FULL_DATADIR}/icons")
file(RELATIVE_PATH VEL_ICONS_FROM_LIBRARY "${CMAKE_INSTALL_FULL_LIBDIR}" "${CMAKE_INSTALL_FULL_DATADIR}/icons")
file(RELATIVE_PATH VEL_PROGRAMS_FROM_LIBRARY "${CMAKE_INSTALL_FULL_LIBDIR}" "${CMAKE_INSTALL_FULL_BINDIR}")

option(VEL_INSTALL_RPATH
    "Installed programs and libraries find ours from where they lie; packages for a system's own folders need no such path" ON)

# vel_set_install_rpath(<target> <folder>): <target>, which is installed in <folder>, finds our
# libraries, wherever the prefix is.
function(vel_set_install_rpath target folder)
    if(NOT VEL_INSTALL_RPATH)
        return()
    endif()
    get_filename_component(full_folder "${folder}" ABSOLUTE BASE_DIR "${CMAKE_INSTALL_PREFIX}")
    file(RELATIVE_PATH way "${full_folder}" "${CMAKE_INSTALL_FULL_LIBDIR}")
    string(REGEX REPLACE "/$" "" rpath "$ORIGIN/${way}")
    # What whoever builds asks for comes after it.
    set_target_properties(${target} PROPERTIES INSTALL_RPATH "${rpath};${CMAKE_INSTALL_RPATH}")
    # A program may be tried with other libraries than those of its prefix.
    target_link_options(${target} PRIVATE LINKER:--enable-new-dtags)
endfunction()
