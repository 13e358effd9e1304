# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

# Sets OLVANE_GNUSTEP_FOUND where the C++ compiler in use takes Objective-C++ and GNUstep's Foundation is installed,
# and OLVANE_GNUSTEP_FLAGS to what a source needs then, OLVANE_GNUSTEP_C_FLAGS for plain Objective-C.
include(CheckLanguage)

find_path(OLVANE_GNUSTEP_INCLUDE_DIR Foundation/Foundation.h PATH_SUFFIXES GNUstep)
find_library(OLVANE_GNUSTEP_BASE_LIBRARY gnustep-base)
set(OLVANE_GNUSTEP_FOUND OFF)
set(OLVANE_GNUSTEP_FLAGS -fobjc-exceptions -fconstant-string-class=NSConstantString)
set(OLVANE_GNUSTEP_C_FLAGS ${OLVANE_GNUSTEP_FLAGS})

# Clang has no Objective-C headers of its own; those of GCC's runtime are taken, behind everything else.
if(CMAKE_CXX_COMPILER_ID STREQUAL "Clang")
  execute_process(COMMAND gcc -print-file-name=include OUTPUT_VARIABLE gcc_headers OUTPUT_STRIP_TRAILING_WHITESPACE)
  list(APPEND OLVANE_GNUSTEP_FLAGS -fobjc-runtime=gcc -idirafter ${gcc_headers})
endif()

if(OLVANE_GNUSTEP_INCLUDE_DIR AND OLVANE_GNUSTEP_BASE_LIBRARY)
  if(NOT DEFINED ENV{OBJCXX})
    set(ENV{OBJCXX} ${CMAKE_CXX_COMPILER})
  endif()
  if(NOT DEFINED ENV{OBJC})
    set(ENV{OBJC} ${CMAKE_C_COMPILER})
  endif()
  check_language(OBJC)
  check_language(OBJCXX)
endif()
if(CMAKE_OBJC_COMPILER AND CMAKE_OBJCXX_COMPILER)
  enable_language(OBJC)
  # The compiler for C may be another one than that for C++.
  if(CMAKE_OBJC_COMPILER_ID STREQUAL "Clang")
    execute_process(COMMAND gcc -print-file-name=include OUTPUT_VARIABLE gcc_headers OUTPUT_STRIP_TRAILING_WHITESPACE)
    list(APPEND OLVANE_GNUSTEP_C_FLAGS -fobjc-runtime=gcc -idirafter ${gcc_headers})
  endif()
  enable_language(OBJCXX)
  include(CheckOBJCXXSourceCompiles)
  string(JOIN " " CMAKE_REQUIRED_FLAGS ${OLVANE_GNUSTEP_FLAGS})
  set(CMAKE_REQUIRED_INCLUDES ${OLVANE_GNUSTEP_INCLUDE_DIR})
  set(CMAKE_REQUIRED_DEFINITIONS -D_NATIVE_OBJC_EXCEPTIONS -w)
  set(CMAKE_REQUIRED_LIBRARIES ${OLVANE_GNUSTEP_BASE_LIBRARY} objc)
  check_objcxx_source_compiles(
    "#import <Foundation/Foundation.h>
     int main() { return [@\"17\" integerValue] == 17 ? 0 : 1; }" OLVANE_GNUSTEP_COMPILES)
  set(OLVANE_GNUSTEP_FOUND ${OLVANE_GNUSTEP_COMPILES})
endif()
