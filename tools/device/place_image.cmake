# cmake -DTREE=... -DFOLDER=... -P place_image.cmake: puts the device's library, from the build tree
# TREE of the preset wince-arm, where the stand-in in FOLDER looks for it, and beside it the block of
# its arithmetic helpers, so that these can be counted, and the link map that names its functions.
set(image ${TREE}/bin/korcontrols.dll)
set(map ${TREE}/bin/korcontrols.map)
set(helpers ${TREE}/src/platform/ce/arithmetic.obj)
foreach(file IN ITEMS ${image} ${map} ${helpers})
  if(NOT EXISTS ${file})
    message(FATAL_ERROR "${file} is missing: build the preset wince-arm first")
  endif()
endforeach()
file(MAKE_DIRECTORY ${FOLDER}/device)
file(COPY_FILE ${image} ${FOLDER}/device/korcontrols.dll ONLY_IF_DIFFERENT)
file(COPY_FILE ${map} ${FOLDER}/device/korcontrols.map ONLY_IF_DIFFERENT)
execute_process(
  COMMAND python3 ${CMAKE_CURRENT_LIST_DIR}/extract_arithmetic.py ${helpers}
    ${FOLDER}/device/arithmetic.bin
  COMMAND_ERROR_IS_FATAL ANY)
