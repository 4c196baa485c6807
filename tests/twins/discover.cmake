# Included by CTest in a folder's tests: adds tests of PROGRAM once more, as "KIND.<test>", run with
# another library. Their names are NAMES, or come from the program beside the desktop's library
# (LISTED); what runs is its twin beside the other one (TESTED), once the FIXTURE is there.
#
# Tests that do not apply say why and count as skipped: all of the program for its REASON, or those
# in the file NOT_APPLICABLE, which has a test's name and a reason in each line.
set(listing ${LISTING})
if(NOT EXISTS ${LISTED})
  add_test(${KIND}.${PROGRAM}_NOT_BUILT ${PROGRAM}_NOT_BUILT)
  set_tests_properties(${KIND}.${PROGRAM}_NOT_BUILT PROPERTIES LABELS ${LABEL})
  return()
endif()

# ---- The names -------------------------------------------------------------------------------------

set(tests "${NAMES}")
if(NOT tests)
  if(NOT EXISTS ${listing} OR NOT ${listing} IS_NEWER_THAN ${LISTED})
    execute_process(COMMAND ${EMULATOR} ${LISTED} --gtest_list_tests
      OUTPUT_VARIABLE output RESULT_VARIABLE status TIMEOUT 120)
    if(NOT status EQUAL 0)
      message(FATAL_ERROR "${LISTED} cannot list its tests: ${status}\n${output}")
    endif()
    file(WRITE ${listing} "${output}")
  endif()
  file(STRINGS ${listing} lines)
  foreach(line IN LISTS lines)
    string(REGEX REPLACE " +#.*" "" line "${line}")  # a parameter's value
    string(REGEX REPLACE "[ \r]+$" "" line "${line}")
    if(line MATCHES "^[^ ].*\\.$")
      set(suite "${line}")
    elseif(line MATCHES "^  (.+)$")
      list(APPEND tests "${suite}${CMAKE_MATCH_1}")
    endif()
  endforeach()
endif()

# ---- The tests -------------------------------------------------------------------------------------

list(LENGTH tests count)
if(REASON)
  message("${KIND} skips the ${count} tests of ${PROGRAM}: ${REASON}")
endif()
file(STRINGS ${NOT_APPLICABLE} exceptions REGEX "^[^#]")
foreach(test IN LISTS tests)
  set(reason "${REASON}")
  foreach(exception IN LISTS exceptions)
    string(FIND "${exception}" "${test} " place)
    if(place EQUAL 0)
      string(REPLACE "${test} " "" reason "${exception}")
      message("${KIND} skips ${test}: ${reason}")
    endif()
  endforeach()
  if(reason)
    add_test(${KIND}.${test} ${CMAKE} -E echo "does not apply to the ${LABEL}: ${reason}")
    set_tests_properties(${KIND}.${test} PROPERTIES
      LABELS ${LABEL} SKIP_REGULAR_EXPRESSION "does not apply to the ${LABEL}")
  else()
    add_test(${KIND}.${test} ${EMULATOR} ${TESTED} --gtest_filter=${test})
    set_tests_properties(${KIND}.${test} PROPERTIES
      LABELS ${LABEL} TIMEOUT 900
      SKIP_REGULAR_EXPRESSION "\\[  SKIPPED \\]" FAIL_REGULAR_EXPRESSION "Running 0 tests")
    if(FIXTURE)
      set_tests_properties(${KIND}.${test} PROPERTIES FIXTURES_REQUIRED ${FIXTURE})
    endif()
  endif()
endforeach()
