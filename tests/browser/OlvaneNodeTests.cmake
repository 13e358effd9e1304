# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

# Makes each test of node's runner a test of CTest: PREFIX.RUN runs them all once and writes RESULTS, and PREFIX.SUITE.TITLE
# reads its own result there. A run that ends counts as passed, so that only the tests that failed fail.
#
#     olvane_node_tests(PREFIX RESULTS FILES ... COMMAND ... [PROPERTIES ...] [ENTRY_LABEL LABEL])
function(olvane_node_tests prefix results)
  cmake_parse_arguments(PARSE_ARGV 2 node "" "ENTRY_LABEL" "FILES;COMMAND;PROPERTIES")
  set(list ${CMAKE_CURRENT_BINARY_DIR}/${prefix}.list)
  execute_process(COMMAND ${OLVANE_NODE} ${PROJECT_SOURCE_DIR}/tests/browser/list-tests.mjs ${node_FILES}
                  OUTPUT_FILE ${list} COMMAND_ERROR_IS_FATAL ANY)
  set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${node_FILES})
  set(read ${PROJECT_SOURCE_DIR}/tests/browser/read_result.py ${results})

  add_test(NAME ${prefix}.RUN COMMAND ${PROJECT_SOURCE_DIR}/tests/browser/run-once ${results} ${node_COMMAND})
  set_tests_properties(${prefix}.RUN PROPERTIES FIXTURES_SETUP ${prefix}Results ${node_PROPERTIES})
  add_test(NAME ${prefix}.everyTestIsListed COMMAND ${read} --all ${list})
  set(entries ${prefix}.everyTestIsListed)
  file(STRINGS ${list} lines ENCODING UTF-8)
  foreach(line IN LISTS lines)
    string(REGEX MATCH "^([^\t]*)\t([^\t]*)\t(.*)$" found "${line}")
    set(title "${CMAKE_MATCH_2}")
    set(name "${prefix}.${CMAKE_MATCH_1}: ${CMAKE_MATCH_2}")
    set(kind)
    if(CMAKE_MATCH_3 STREQUAL "prefix")
      set(kind --prefix)
    endif()
    string(REGEX REPLACE "[\"\\\\;$]" "" name "${name}")
    if(TEST "${name}")
      message(FATAL_ERROR "Two tests are called ${name}")
    endif()
    add_test(NAME "${name}" COMMAND ${read} "${title}" ${kind})
    list(APPEND entries "${name}")
  endforeach()
  set_tests_properties(${entries} PROPERTIES FIXTURES_REQUIRED ${prefix}Results SKIP_RETURN_CODE 77)
  if(node_ENTRY_LABEL)
    set_tests_properties(${entries} PROPERTIES LABELS ${node_ENTRY_LABEL})
  endif()
endfunction()
