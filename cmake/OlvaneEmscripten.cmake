# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

# What a build for a browser needs. Boost is headers alone, and lies among the machine's own headers, which are for
# another machine than WebAssembly's; so a folder that holds nothing but a link to it stands for it.
find_path(OLVANE_BOOST_INCLUDE_DIR boost/version.hpp PATHS /usr/include /usr/local/include REQUIRED
          NO_CMAKE_FIND_ROOT_PATH)
set(boost_alone ${CMAKE_BINARY_DIR}/boost-alone)
file(MAKE_DIRECTORY ${boost_alone})
file(CREATE_LINK ${OLVANE_BOOST_INCLUDE_DIR}/boost ${boost_alone}/boost SYMBOLIC)
add_library(Boost::headers INTERFACE IMPORTED GLOBAL)
target_include_directories(Boost::headers INTERFACE ${boost_alone})

# Exceptions as WebAssembly has them: smaller and faster than those by way of JavaScript.
add_compile_options(-fwasm-exceptions)
add_link_options(-fwasm-exceptions)

# A page carries the module, so bytes count beside time. The engine is built for speed, the rest for size: with the small
# functions in their callers that takes no longer, and browsers have less to compile. For size, em++ leaves those
# functions to the linker, which sees too late what falls away with them, so the compiler is asked for it by name.
set(CMAKE_CXX_FLAGS_RELEASE "-O2 -DNDEBUG")
set(OLVANE_SMALL_TARGETS olvane_picture olvane_gedcom olvane_family olvane_gedcom_source olvane_charts olvane_draw olvane_wasm olvane_core)
function(olvane_build_small)
  foreach(target IN LISTS OLVANE_SMALL_TARGETS)
    target_compile_options(${target} PRIVATE -Oz -finline-functions)
  endforeach()
  # Of the families, what answers the engine's questions: a tenth of a layout's time.
  foreach(source IN ITEMS Family FamilyDataSource FamilyStorage)
    set_source_files_properties(${PROJECT_SOURCE_DIR}/family/olvane/kin/${source}.cpp
      TARGET_DIRECTORY olvane_family PROPERTIES COMPILE_OPTIONS "-O2")
  endforeach()
  # Of the pictures, what only a picture with years of marriages runs through.
  set_source_files_properties(${PROJECT_SOURCE_DIR}/picture/olvane/picture/MarriageLabels.cpp
    TARGET_DIRECTORY olvane_picture PROPERTIES COMPILE_OPTIONS "-Oz;-finline-functions")
endfunction()
