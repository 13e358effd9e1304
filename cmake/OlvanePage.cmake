# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

# The viewer page: the engine for browsers by an inner build of this project with Emscripten, then the page's code
# bundled around it into one file.

set(OLVANE_BUILD_PAGE AUTO CACHE STRING "Build the viewer page: ON, OFF, or AUTO where its tools are found")
set_property(CACHE OLVANE_BUILD_PAGE PROPERTY STRINGS AUTO ON OFF)
find_program(OLVANE_EMCMAKE emcmake)
find_program(OLVANE_NODE node)
find_program(OLVANE_NPM npm)
if(OLVANE_BUILD_PAGE STREQUAL "OFF")
  return()
endif()
# Where no network may be asked, the modules that npm would install lie in a folder, and the bundler is the system's.
set(OLVANE_PAGE_MODULES "" CACHE PATH "Folder of the page's modules, in place of what npm installs")
if(OLVANE_PAGE_MODULES)
  set(OLVANE_NPM "${OLVANE_PAGE_MODULES}")
endif()
if(NOT OLVANE_EMCMAKE OR NOT OLVANE_NODE OR NOT OLVANE_NPM)
  if(OLVANE_BUILD_PAGE STREQUAL "ON")
    message(FATAL_ERROR "OLVANE_BUILD_PAGE needs emscripten, nodejs and npm; install them or switch the option off")
  endif()
  message(STATUS "olvane: the viewer page is not built, because emscripten, nodejs or npm is missing")
  return()
endif()

include(ExternalProject)
set(OLVANE_WASM ${CMAKE_BINARY_DIR}/wasm/bindings/javascript/module/olvane.wasm)
set(inner_targets olvane_wasm)
if(OLVANE_DEV)
  list(APPEND inner_targets layout-case)
endif()
# Debian's Emscripten finds its own parser by NODE_PATH. Flags of the environment are meant for this machine's compilers.
set(for_emscripten ${CMAKE_COMMAND} -E env --unset=CFLAGS --unset=CXXFLAGS --unset=CPPFLAGS --unset=LDFLAGS
    NODE_PATH=/usr/share/nodejs)
ExternalProject_Add(olvane_wasm_module
  SOURCE_DIR ${PROJECT_SOURCE_DIR}
  BINARY_DIR ${CMAKE_BINARY_DIR}/wasm
  PREFIX ${CMAKE_BINARY_DIR}/wasm-stamps
  CONFIGURE_COMMAND ${for_emscripten} ${OLVANE_EMCMAKE} ${CMAKE_COMMAND} -S <SOURCE_DIR> -B <BINARY_DIR>
                    -G ${CMAKE_GENERATOR} -DCMAKE_BUILD_TYPE=Release
  BUILD_COMMAND ${for_emscripten} ${CMAKE_COMMAND} --build <BINARY_DIR> --target ${inner_targets}
  INSTALL_COMMAND ""
  BUILD_ALWAYS ON
  BUILD_BYPRODUCTS ${OLVANE_WASM}
  LOG_CONFIGURE ON
  LOG_BUILD ON
  LOG_OUTPUT_ON_FAILURE ON)

set(OLVANE_PAGE_TEMPLATE ${CMAKE_BINARY_DIR}/apps/page/page.html)
set(OLVANE_TREE_ELEMENT ${CMAKE_BINARY_DIR}/apps/page/olvane-tree.mjs)
file(GLOB_RECURSE page_sources CONFIGURE_DEPENDS
  ${PROJECT_SOURCE_DIR}/apps/page/src/* ${PROJECT_SOURCE_DIR}/apps/page/*.mjs ${PROJECT_SOURCE_DIR}/apps/page/*.json
  ${PROJECT_SOURCE_DIR}/bindings/javascript/*.mjs)
list(FILTER page_sources EXCLUDE REGEX "/node_modules/")
add_custom_command(OUTPUT ${OLVANE_PAGE_TEMPLATE} ${OLVANE_TREE_ELEMENT}
  COMMAND ${CMAKE_COMMAND} -E env OLVANE_JAVASCRIPT=${PROJECT_SOURCE_DIR}/bindings/javascript
          OLVANE_PAGE_MODULES=${OLVANE_PAGE_MODULES}
          ${PROJECT_SOURCE_DIR}/apps/page/build-page ${CMAKE_BINARY_DIR}/apps/page/work ${OLVANE_WASM}
          ${OLVANE_PAGE_TEMPLATE} ${OLVANE_TREE_ELEMENT}
  DEPENDS olvane_wasm_module ${OLVANE_WASM} ${PROJECT_SOURCE_DIR}/apps/page/build-page ${page_sources}
  COMMENT "Building the viewer page"
  VERBATIM)
add_custom_target(olvane_page_template DEPENDS ${OLVANE_PAGE_TEMPLATE})
