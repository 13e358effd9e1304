# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

# What every target of ours is compiled with. Exact results are part of the interface: a fused multiply-add would
# change them, so contraction is off for the engine and for everything that compares with it.
function(olvane_target target)
  target_compile_options(${target} PRIVATE -ffp-contract=off)
  set_target_properties(${target} PROPERTIES CXX_VISIBILITY_PRESET hidden VISIBILITY_INLINES_HIDDEN ON)
  if(NOT EMSCRIPTEN)
    set_target_properties(${target} PROPERTIES POSITION_INDEPENDENT_CODE ON)
  endif()
  if(OLVANE_DEV)
    target_compile_options(${target} PRIVATE -Wall -Wextra -Wconversion -Wshadow)
    if(CMAKE_CXX_COMPILER_ID STREQUAL "GNU")
      # GCC 12 sees an overlap in "text" + std::string wherever it inlines the sum, uninitialized bytes in a copied
      # boost::function whose closure is smaller than its buffer, and a moved pointer where a vector of bytes is
      # destroyed after a write through it. There are none; Clang and the sanitizers look too.
      target_compile_options(${target} PRIVATE -Wno-restrict -Wno-uninitialized -Wno-maybe-uninitialized
                                               -Wno-free-nonheap-object)
    endif()
    if(OLVANE_WERROR)
      target_compile_options(${target} PRIVATE -Werror)
    endif()
  endif()
endfunction()
