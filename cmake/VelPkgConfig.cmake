# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

# vel_install_pkgconfig(<name> COMPONENT <component> TEMPLATE <file>)
#
# Installs <name>.pc. What the template names as @VARIABLE@ is filled in; @prefix@ and @libdir@ are
# given as seen from the file itself, so that the prefix may be chosen late, and moved.
function(vel_install_pkgconfig name)
    cmake_parse_arguments(ARG "" "COMPONENT;TEMPLATE" "" ${ARGN})
    file(RELATIVE_PATH way_up "${CMAKE_INSTALL_FULL_LIBDIR}/pkgconfig" "${CMAKE_INSTALL_PREFIX}")
    string(REGEX REPLACE "/$" "" prefix "\${pcfiledir}/${way_up}")
    set(libdir "\${prefix}/${CMAKE_INSTALL_LIBDIR}")
    if(IS_ABSOLUTE "${CMAKE_INSTALL_LIBDIR}")
        set(libdir "${CMAKE_INSTALL_LIBDIR}")
    endif()
    configure_file("${ARG_TEMPLATE}" "${CMAKE_CURRENT_BINARY_DIR}/${name}.pc" @ONLY)
    install(FILES "${CMAKE_CURRENT_BINARY_DIR}/${name}.pc"
        DESTINATION "${CMAKE_INSTALL_LIBDIR}/pkgconfig" COMPONENT ${ARG_COMPONENT})
endfunction()
