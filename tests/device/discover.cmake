# Included by CTest in a folder's tests: adds the tests of PROGRAM once more, as "device.<test>", run
# on the device's image. The names come from the program beside the desktop's library (LISTED), what
# runs is its twin beside the stand-in (TESTED). Tests of NOT_APPLICABLE, a file with a test's name and
# a reason in each line, say the reason and count as skipped.
set(listing ${CMAKE_CURRENT_LIST_DIR}/${PROGRAM}.tests)
if(NOT EXISTS ${LISTED})
  add_test(device.${PROGRAM}_NOT_BUILT ${PROGRAM}_NOT_BUILT)
  return()
endif()
if(NOT EXISTS ${listing} OR NOT ${listing} IS_NEWER_THAN ${LISTED})
  execute_process(COMMAND ${EMULATOR} ${LISTED} --gtest_list_tests
    OUTPUT_VARIABLE output RESULT_VARIABLE status TIMEOUT 120)
  if(NOT status EQUAL 0)
    message(FATAL_ERROR "${LISTED} cannot list its tests: ${status}\n${output}")
  endif()
  file(WRITE ${listing} "${output}")
endif()

file(STRINGS ${NOT_APPLICABLE} exceptions REGEX "^[^#]")
file(STRINGS ${listing} lines)
set(suite "")
foreach(line IN LISTS lines)
  string(REGEX REPLACE " +#.*" "" line "${line}")  # a parameter's value
  string(REGEX REPLACE "[ \r]+$" "" line "${line}")
  if(line MATCHES "^[^ ].*\\.$")
    set(suite "${line}")
  elseif(line MATCHES "^  (.+)$")
    set(test "${suite}${CMAKE_MATCH_1}")
    if(test MATCHES "^DISABLED_|\\.DISABLED_")
      continue()
    endif()
    set(reason "")
    foreach(exception IN LISTS exceptions)
      string(FIND "${exception}" "${test} " place)
      if(place EQUAL 0)
        string(REPLACE "${test} " "" reason "${exception}")
      endif()
    endforeach()
    if(reason)
      add_test(device.${test} ${CMAKE} -E echo "does not apply to the device: ${reason}")
      set_tests_properties(device.${test} PROPERTIES
        LABELS device SKIP_REGULAR_EXPRESSION "does not apply to the device")
    else()
      add_test(device.${test} ${EMULATOR} ${TESTED} --gtest_filter=${test})
      set_tests_properties(device.${test} PROPERTIES
        LABELS device TIMEOUT 300 FIXTURES_REQUIRED device_image)
    endif()
  endif()
endforeach()
