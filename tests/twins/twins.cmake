# Twins of the desktop's tests: the same programs beside another korcontrols.dll.

# korcontrols_place_programs(FOLDER): all that the tests run.
function(korcontrols_place_programs folder)
  get_property(programs GLOBAL PROPERTY KORCONTROLS_TEST_PROGRAMS)
  foreach(program IN LISTS programs
      ITEMS commdlg wingdi faulty_library guard_victim reload_host module_host saving_loop clipboard_partner
        workbook window_probe chart_viewer smallest_host function_bar printing_host)
    if(TARGET ${program})
      korcontrols_place_beside(${folder} ${program})
    endif()
  endforeach()
endfunction()

# korcontrols_add_twins(KIND LABEL FIXTURE PROGRAM TESTED REASON [TEST...]): the program's tests, or
# these of them, once more as "KIND.<test>", by running TESTED. Where there is a REASON, they do not
# apply. not_applicable.txt in the caller's folder names single ones that do not.
function(korcontrols_add_twins kind label fixture program tested reason)
  set(include ${CMAKE_CURRENT_BINARY_DIR}/${kind}.${program}.cmake)
  file(GENERATE OUTPUT ${include} CONTENT
"set(KIND ${kind})
set(LABEL ${label})
set(FIXTURE \"${fixture}\")
set(PROGRAM ${program})
set(REASON \"${reason}\")
set(NAMES \"${ARGN}\")
set(LISTING ${CMAKE_BINARY_DIR}/tests/${program}.tests)
set(CMAKE ${CMAKE_COMMAND})
set(EMULATOR ${CMAKE_CROSSCOMPILING_EMULATOR})
set(LISTED $<TARGET_FILE:${program}>)
set(TESTED ${tested})
set(NOT_APPLICABLE ${CMAKE_CURRENT_SOURCE_DIR}/not_applicable.txt)
include(${PROJECT_SOURCE_DIR}/tests/twins/discover.cmake)
")
  set_property(DIRECTORY APPEND PROPERTY TEST_INCLUDE_FILES ${include})
endfunction()
