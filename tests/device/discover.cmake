# Included by CTest in a folder's tests: adds tests of PROGRAM once more, as "device.<test>", run on
# the device's image. Their names are NAMES, or come from the program beside the desktop's library
# (LISTED); what runs is its twin beside the stand-in (TESTED).
#
# Tests that do not apply say why and count as skipped: all of the program for its REASON, or those
# in the file NOT_APPLICABLE, which has a test's name and a reason in each line.
set(listing ${FOLDER}/${PROGRAM}.tests)
if(NOT EXISTS ${LISTED})
  add_test(device.${PROGRAM}_NOT_BUILT ${PROGRAM}_NOT_BUILT)
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
  message("device skips the ${count} tests of ${PROGRAM}: ${REASON}")
endif()
file(STRINGS ${NOT_APPLICABLE} exceptions REGEX "^[^#]")
foreach(test IN LISTS tests)
  set(reason "${REASON}")
  foreach(exception IN LISTS exceptions)
    string(FIND "${exception}" "${test} " place)
    if(place EQUAL 0)
      string(REPLACE "${test} " "" reason "${exception}")
      message("device skips ${test}: ${reason}")
    endif()
  endforeach()
  if(reason)
    add_test(device.${test} ${CMAKE} -E echo "does not apply to the device: ${reason}")
    set_tests_properties(device.${test} PROPERTIES
      LABELS device SKIP_REGULAR_EXPRESSION "does not apply to the device")
  else()
    add_test(device.${test} ${EMULATOR} ${TESTED} --gtest_filter=${test})
    set_tests_properties(device.${test} PROPERTIES
      LABELS device TIMEOUT 900 FIXTURES_REQUIRED device_image
      SKIP_REGULAR_EXPRESSION "\\[  SKIPPED \\]" FAIL_REGULAR_EXPRESSION "Running 0 tests")
  endif()
endforeach()
