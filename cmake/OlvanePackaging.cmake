# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

# Debian packages, by "cpack -G DEB" in a build folder: the library, what a developer needs, the command, and the roads
# for Foundation and Python where they were built. Included last, when all install rules are known.

set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME olvane)
set(CPACK_PACKAGE_VENDOR "The Olvane developers")
set(CPACK_PACKAGE_CONTACT "The Olvane developers <olvane@localhost>")
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_STRIP_FILES ON)
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_COMPONENTS_GROUPING IGNORE)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_ENABLE_COMPONENT_DEPENDS OFF)
# A package of the build finds the libraries of the others there, not in the system.
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${PROJECT_BINARY_DIR}/bindings/c ${PROJECT_BINARY_DIR}/engine)

# component, package, section, and what it depends on beside the shared libraries that it links
set(CPACK_COMPONENTS_ALL "")
function(olvane_package component package section depends description)
  string(TOUPPER ${component} key)
  set(CPACK_COMPONENTS_ALL ${CPACK_COMPONENTS_ALL} ${component} PARENT_SCOPE)
  set(CPACK_DEBIAN_${key}_PACKAGE_NAME ${package} PARENT_SCOPE)
  set(CPACK_DEBIAN_${key}_PACKAGE_SECTION ${section} PARENT_SCOPE)
  set(CPACK_DEBIAN_${key}_PACKAGE_DEPENDS "${depends}" PARENT_SCOPE)
  set(CPACK_COMPONENT_${key}_DESCRIPTION "${description}" PARENT_SCOPE)
  install(FILES ${PROJECT_SOURCE_DIR}/LICENSE DESTINATION ${CMAKE_INSTALL_DATADIR}/doc/${package}
    RENAME copyright COMPONENT ${component})
endfunction()

set(library_package libolvane-c${OLVANE_SOVERSION})
set(same_library "${library_package} (= ${PROJECT_VERSION})")

olvane_package(dev libolvane-dev libdevel "${same_library}, libboost-dev (>= 1.74)"
  "Layout engine of a family-tree viewer: headers for C++ and C
 Which relatives of a person a family tree shows, and where each box and line stands.")
if(TARGET olvane_c)
  olvane_package(library ${library_package} libs ""
    "Layout engine of a family-tree viewer: shared library
 Which relatives of a person a family tree shows, and where each box and line stands.")
  set(CPACK_DEBIAN_LIBRARY_PACKAGE_CONTROL_EXTRA ${CMAKE_CURRENT_LIST_DIR}/triggers)
  olvane_package(python python3-olvane python "${same_library}, python3 (>= 3.11)"
    "Layout engine of a family-tree viewer: Python package
 A host is any object with eight methods; a layout is a list of records.")
  set(CPACK_DEBIAN_PYTHON_PACKAGE_ARCHITECTURE all)
endif()
if(TARGET olvane_wasm_module)
  olvane_package(javascript node-olvane javascript ""
    "Layout engine of a family-tree viewer: JavaScript package
 A host is any object with eight methods; GEDCOM files are read as well. For node and browsers, by WebAssembly.")
  set(CPACK_DEBIAN_JAVASCRIPT_PACKAGE_ARCHITECTURE all)
endif()
if(TARGET olvane_foundation)
  olvane_package(foundation libolvane-foundation-dev libdevel "libgnustep-base-dev"
    "Layout engine of a family-tree viewer: bridge for hosts on Foundation
 One class and one protocol in Objective-C, and the library behind them.")
endif()
if(TARGET olvane)
  olvane_package(command olvane misc ""
    "Family trees from GEDCOM files
 Lists persons, lays out families and pedigrees, and draws them as SVG.")
endif()

include(CPack)
