# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

# Where things are installed, seen from each other: what was installed together finds its neighbors
# from where it lies itself, so that a prefix may be moved.

file(RELATIVE_PATH VEL_DATA_FROM_LIBRARY "${CMAKE_INSTALL_FULL_LIBDIR}" "${CMAKE_INSTALL_FULL_DATADIR}/vel")
file(RELATIVE_PATH VEL_DATA_FROM_PROGRAM "${CMAKE_INSTALL_FULL_BINDIR}" "${CMAKE_INSTALL_FULL_DATADIR}/vel")
file(RELATIVE_PATH VEL_ICONS_FROM_PROGRAM "${CMAKE_INSTALL_FULL_BINDIR}" "${CMAKE_INSTALL_FULL_DATADIR}/icons")
file(RELATIVE_PATH VEL_PROGRAMS_FROM_LIBRARY "${CMAKE_INSTALL_FULL_LIBDIR}" "${CMAKE_INSTALL_FULL_BINDIR}")
