# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

# Installs the library so that find_package(${VEL_PACKAGE}) and pkg-config find it.

include(CMakePackageConfigHelpers)
include(VelPkgConfig)

set(VEL_CMAKE_DIR "${CMAKE_INSTALL_LIBDIR}/cmake/${VEL_PACKAGE}")

set_target_properties(veluiextra PROPERTIES EXPORT_NAME VelUIExtra)
vel_set_install_rpath(veluiextra "${CMAKE_INSTALL_LIBDIR}")
install(TARGETS veluiextra EXPORT VelUIExtraTargets
    LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT library NAMELINK_COMPONENT devel
    ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT devel)
install(DIRECTORY "${VEL_PUBLIC_INCLUDE_DIR}/" "${CMAKE_CURRENT_BINARY_DIR}/include/"
    DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/veluiextra${VEL_QT_SUFFIX} COMPONENT devel FILES_MATCHING PATTERN "*.h")

install(EXPORT VelUIExtraTargets NAMESPACE ${VEL_PACKAGE}:: DESTINATION ${VEL_CMAKE_DIR} COMPONENT devel)
if(VEL_PLATFORM STREQUAL "bundled")
    install(EXPORT VelCoreTargets NAMESPACE Vel:: DESTINATION ${VEL_CMAKE_DIR} COMPONENT devel)
    install(EXPORT VelPlatformTargets NAMESPACE Vel:: DESTINATION ${VEL_CMAKE_DIR} COMPONENT devel)
endif()
set(VEL_QT_MODULES ${VEL_QT_LIBRARIES})
list(FILTER VEL_QT_MODULES INCLUDE REGEX "^${VEL_QT}::")
list(TRANSFORM VEL_QT_MODULES REPLACE "^${VEL_QT}::" "")
list(JOIN VEL_QT_MODULES " " VEL_QT_MODULES)
configure_package_config_file("${PROJECT_SOURCE_DIR}/cmake/VelUIExtraConfig.cmake.in"
    "${CMAKE_CURRENT_BINARY_DIR}/${VEL_PACKAGE}Config.cmake" INSTALL_DESTINATION ${VEL_CMAKE_DIR})
write_basic_package_version_file("${CMAKE_CURRENT_BINARY_DIR}/${VEL_PACKAGE}ConfigVersion.cmake"
    COMPATIBILITY SameMajorVersion)
install(FILES "${CMAKE_CURRENT_BINARY_DIR}/${VEL_PACKAGE}Config.cmake"
    "${CMAKE_CURRENT_BINARY_DIR}/${VEL_PACKAGE}ConfigVersion.cmake"
    DESTINATION ${VEL_CMAKE_DIR} COMPONENT devel)

# What a host of the static library links as well.
set(private_requires velcore velintegration${VEL_QT_SUFFIX})
set(private_libs)
set(flags)
if(VEL_LIBRARY_TYPE STREQUAL "STATIC")
    set(qt_modules ${VEL_QT_LIBRARIES})
    list(FILTER qt_modules INCLUDE REGEX "^${VEL_QT}::")
    set(frameworks ${VEL_QT_LIBRARIES} ${CMAKE_DL_LIBS})
    list(FILTER frameworks EXCLUDE REGEX "^${VEL_QT}::")
    list(TRANSFORM frameworks PREPEND "-l")
    list(APPEND private_requires ${qt_modules} x11 xkbcommon)
    set(private_libs -Wl,--undefined=veluiextra_catalog ${frameworks})
    set(flags -DVELUIEXTRA_STATIC_DEFINE)
endif()
string(REPLACE "::" "" private_requires "${private_requires}")
string(REPLACE "::" "" private_libs "${private_libs}")
list(JOIN private_requires " " private_requires)
list(JOIN private_libs " " private_libs)

vel_install_pkgconfig(veluiextra${VEL_QT_SUFFIX} COMPONENT devel TEMPLATE "${PROJECT_SOURCE_DIR}/cmake/veluiextra.pc.in")
