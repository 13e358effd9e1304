# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

# The one place that says which version this is: MAJOR.MINOR.PATCH, by the rules of semantic versions.
set(OLVANE_VERSION 0.1.0)

string(REPLACE "." ";" numbers ${OLVANE_VERSION})
list(GET numbers 0 major)
list(GET numbers 1 minor)
list(GET numbers 2 patch)

# What the names of shared libraries and of their packages end in. While the major number is 0, a library of another minor
# number may not take this one's place.
if(major EQUAL 0)
  set(OLVANE_SOVERSION ${major}.${minor})
else()
  set(OLVANE_SOVERSION ${major})
endif()

# The macros of the headers say the same.
foreach(header engine/olvane/Version.h bindings/c/olvane.h)
  file(STRINGS ${CMAKE_CURRENT_LIST_DIR}/../${header} macros REGEX "^#define OLVANE_VERSION_(MAJOR|MINOR|PATCH) [0-9]+$")
  set(expected "#define OLVANE_VERSION_MAJOR ${major};#define OLVANE_VERSION_MINOR ${minor};#define OLVANE_VERSION_PATCH ${patch}")
  if(NOT macros STREQUAL expected)
    message(FATAL_ERROR "${header} says another version than ${OLVANE_VERSION}: ${macros}")
  endif()
endforeach()
