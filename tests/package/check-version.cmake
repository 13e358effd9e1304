# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

# Which versions asked for by find_package this one serves: those of its own minor number while its major number is 0,
# and then those of its major number that are not newer.
#
#     cmake -DVERSION=MAJOR.MINOR.PATCH -DFILE=olvaneConfigVersion.cmake -P check-version.cmake
string(REPLACE "." ";" numbers ${VERSION})
list(GET numbers 0 major)
list(GET numbers 1 minor)
math(EXPR next_major "${major} + 1")
math(EXPR next_minor "${minor} + 1")
math(EXPR earlier_minor "${minor} - 1")

function(expect asked is_served)
  string(REPLACE "." ";" parts ${asked})
  list(GET parts 0 PACKAGE_FIND_VERSION_MAJOR)
  list(GET parts 1 PACKAGE_FIND_VERSION_MINOR)
  set(PACKAGE_FIND_VERSION ${asked})
  set(PACKAGE_FIND_VERSION_RANGE)
  include(${FILE})
  if(PACKAGE_VERSION_COMPATIBLE AND NOT is_served OR is_served AND NOT PACKAGE_VERSION_COMPATIBLE)
    message(FATAL_ERROR "${VERSION} is asked for ${asked}: expected ${is_served}, got ${PACKAGE_VERSION_COMPATIBLE}")
  endif()
endfunction()

expect(${major}.${minor} TRUE)
expect(${major}.${next_minor} FALSE)
expect(${next_major}.0 FALSE)
if(minor GREATER 0 AND major EQUAL 0)
  expect(${major}.${earlier_minor} FALSE)
elseif(minor GREATER 0)
  expect(${major}.${earlier_minor} TRUE)
endif()
