# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

# vel_install_pkgconfig(<name> COMPONENT <component> TEMPLATE <file>)
#
# Installs <name>.pc. What the template names as @VARIABLE@ is filled in now, except the prefix:
# that is the one of the installation itself, which may be given to "cmake --install" only.
function(vel_install_pkgconfig name)
    cmake_parse_arguments(ARG "" "COMPONENT;TEMPLATE" "" ${ARGN})
    set(prefix "@CMAKE_INSTALL_PREFIX@")
    set(half_done "${CMAKE_CURRENT_BINARY_DIR}/${name}.pc.in")
    configure_file("${ARG_TEMPLATE}" "${half_done}" @ONLY)
    install(CODE "
        configure_file(\"${half_done}\" \"${CMAKE_CURRENT_BINARY_DIR}/${name}.pc\" @ONLY)
        file(INSTALL \"${CMAKE_CURRENT_BINARY_DIR}/${name}.pc\"
            DESTINATION \"\${CMAKE_INSTALL_PREFIX}/${CMAKE_INSTALL_LIBDIR}/pkgconfig\")"
        COMPONENT ${ARG_COMPONENT})
endfunction()
