# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

# The package: what find_package(olvane CONFIG COMPONENTS ...) and pkg-config find. A component is one library with a set
# of targets of its own, so that a consumer needs nothing that its components do not need.

include(CMakePackageConfigHelpers)
set(OLVANE_CMAKE_DIR ${CMAKE_INSTALL_LIBDIR}/cmake/olvane)

# olvane_component(NAME TARGETS ... [REQUIRES ...]): libraries in C++; REQUIRES are modules of pkg-config.
function(olvane_component component)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "TARGETS;REQUIRES")
  list(GET arg_TARGETS 0 first)
  if(NOT TARGET ${first})
    return()
  endif()
  install(TARGETS ${arg_TARGETS} EXPORT olvane-${component}
    ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR}
    LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT library NAMELINK_COMPONENT dev
    FILE_SET HEADERS DESTINATION ${CMAKE_INSTALL_INCLUDEDIR})
  install(EXPORT olvane-${component} NAMESPACE olvane:: DESTINATION ${OLVANE_CMAKE_DIR})
  list(JOIN arg_REQUIRES " " requires)
  list(TRANSFORM arg_TARGETS PREPEND -l)
  list(JOIN arg_TARGETS " " libraries)
  configure_file(${PROJECT_SOURCE_DIR}/cmake/olvane-component.pc.in
                 ${PROJECT_BINARY_DIR}/pkgconfig/olvane-${component}.pc @ONLY)
  install(FILES ${PROJECT_BINARY_DIR}/pkgconfig/olvane-${component}.pc
    DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
endfunction()

set(reader_modules libutf8proc)
if(OLVANE_GEDCOM_ZIP)
  list(APPEND reader_modules libzip)
endif()
olvane_component(engine TARGETS olvane_engine)
olvane_component(family TARGETS olvane_family REQUIRES olvane-engine)
olvane_component(picture TARGETS olvane_picture REQUIRES olvane-family)
olvane_component(charts TARGETS olvane_charts REQUIRES olvane-picture)
olvane_component(draw TARGETS olvane_draw REQUIRES olvane-picture)
olvane_component(gedcom TARGETS olvane_gedcom_source olvane_gedcom REQUIRES olvane-family ${reader_modules})
# The two that are shared libraries with a C interface install themselves; these are their targets. Where all libraries are
# shared, each finds the others beside it.
if(BUILD_SHARED_LIBS)
  foreach(library engine family picture charts draw c foundation)
    if(TARGET olvane_${library})
      set_property(TARGET olvane_${library} PROPERTY INSTALL_RPATH $ORIGIN)
    endif()
  endforeach()
endif()
if(TARGET olvane_c)
  install(EXPORT olvane-c NAMESPACE olvane:: DESTINATION ${OLVANE_CMAKE_DIR} COMPONENT dev)
endif()
if(TARGET olvane_foundation)
  install(EXPORT olvane-foundation NAMESPACE olvane:: DESTINATION ${OLVANE_CMAKE_DIR} COMPONENT foundation)
endif()

configure_package_config_file(cmake/olvaneConfig.cmake.in ${PROJECT_BINARY_DIR}/olvaneConfig.cmake
  INSTALL_DESTINATION ${OLVANE_CMAKE_DIR})
# By the rules of semantic versions, 0.2 may break what 0.1 promised.
if(PROJECT_VERSION_MAJOR EQUAL 0)
  set(compatible_with SameMinorVersion)
else()
  set(compatible_with SameMajorVersion)
endif()
write_basic_package_version_file(${PROJECT_BINARY_DIR}/olvaneConfigVersion.cmake COMPATIBILITY ${compatible_with})
install(FILES ${PROJECT_BINARY_DIR}/olvaneConfig.cmake ${PROJECT_BINARY_DIR}/olvaneConfigVersion.cmake
  DESTINATION ${OLVANE_CMAKE_DIR})

configure_file(cmake/olvane.pc.in ${PROJECT_BINARY_DIR}/pkgconfig/olvane.pc @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/pkgconfig/olvane.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
install(FILES LICENSE DESTINATION ${CMAKE_INSTALL_DOCDIR})
