# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

# The package: what find_package(olvane CONFIG) and pkg-config find.

include(CMakePackageConfigHelpers)

install(TARGETS olvane_engine EXPORT olvaneTargets
  ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR}
  LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT library NAMELINK_COMPONENT dev
  FILE_SET HEADERS DESTINATION ${CMAKE_INSTALL_INCLUDEDIR})
install(EXPORT olvaneTargets NAMESPACE olvane:: DESTINATION ${CMAKE_INSTALL_LIBDIR}/cmake/olvane)

configure_package_config_file(cmake/olvaneConfig.cmake.in ${CMAKE_CURRENT_BINARY_DIR}/olvaneConfig.cmake
  INSTALL_DESTINATION ${CMAKE_INSTALL_LIBDIR}/cmake/olvane)
write_basic_package_version_file(${CMAKE_CURRENT_BINARY_DIR}/olvaneConfigVersion.cmake
  COMPATIBILITY SameMajorVersion)
install(FILES ${CMAKE_CURRENT_BINARY_DIR}/olvaneConfig.cmake ${CMAKE_CURRENT_BINARY_DIR}/olvaneConfigVersion.cmake
  DESTINATION ${CMAKE_INSTALL_LIBDIR}/cmake/olvane)

configure_file(cmake/olvane.pc.in ${CMAKE_CURRENT_BINARY_DIR}/olvane.pc @ONLY)
install(FILES ${CMAKE_CURRENT_BINARY_DIR}/olvane.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
install(FILES LICENSE DESTINATION ${CMAKE_INSTALL_DOCDIR})
