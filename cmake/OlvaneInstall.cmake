# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

# The package: what find_package(olvane CONFIG) and pkg-config find.

include(CMakePackageConfigHelpers)

# The C interface holds pictures too, and so needs their library where libraries are shared.
set(libraries olvane_engine olvane_family)
if(TARGET olvane_picture)
  list(APPEND libraries olvane_picture)
endif()
install(TARGETS ${libraries} EXPORT olvaneTargets
  ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR}
  LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT library NAMELINK_COMPONENT dev
  FILE_SET HEADERS DESTINATION ${CMAKE_INSTALL_INCLUDEDIR})
install(EXPORT olvaneTargets NAMESPACE olvane:: DESTINATION ${CMAKE_INSTALL_LIBDIR}/cmake/olvane)

configure_package_config_file(cmake/olvaneConfig.cmake.in ${CMAKE_CURRENT_BINARY_DIR}/olvaneConfig.cmake
  INSTALL_DESTINATION ${CMAKE_INSTALL_LIBDIR}/cmake/olvane)
# By the rules of semantic versions, 0.2 may break what 0.1 promised.
if(PROJECT_VERSION_MAJOR EQUAL 0)
  set(compatible_with SameMinorVersion)
else()
  set(compatible_with SameMajorVersion)
endif()
write_basic_package_version_file(${CMAKE_CURRENT_BINARY_DIR}/olvaneConfigVersion.cmake
  COMPATIBILITY ${compatible_with})
install(FILES ${CMAKE_CURRENT_BINARY_DIR}/olvaneConfig.cmake ${CMAKE_CURRENT_BINARY_DIR}/olvaneConfigVersion.cmake
  DESTINATION ${CMAKE_INSTALL_LIBDIR}/cmake/olvane)

configure_file(cmake/olvane.pc.in ${CMAKE_CURRENT_BINARY_DIR}/olvane.pc @ONLY)
install(FILES ${CMAKE_CURRENT_BINARY_DIR}/olvane.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
install(FILES LICENSE DESTINATION ${CMAKE_INSTALL_DOCDIR})
