# The workbook's engine: files, formulas, numbers, the clipboard's text, edits. All of it but its
# way to the system's files.
set(workbook_folder ${CMAKE_CURRENT_LIST_DIR}/../../apps/workbook)
file(GLOB workbook_engine CONFIGURE_DEPENDS ${workbook_folder}/model/*.cpp)
list(FILTER workbook_engine EXCLUDE REGEX "/(file_io|file_nature|new_file)\\.cpp$")
add_library(workbook_engine STATIC ${workbook_engine} ${workbook_folder}/tab_text.cpp)
target_include_directories(workbook_engine PUBLIC ${workbook_folder} ${workbook_folder}/model)

# add_workbook_fuzzer(NAME ROUNDS)
function(add_workbook_fuzzer name rounds)
  add_fuzzer(workbook_${name} ${rounds} workbook_${name}.cpp)
  target_link_libraries(fuzz_workbook_${name} PRIVATE workbook_engine)
endfunction()

add_workbook_fuzzer(csv 10000)
add_workbook_fuzzer(edits 2000)
add_workbook_fuzzer(formulas 3000)
add_workbook_fuzzer(numbers 20000)
add_workbook_fuzzer(tab_text 20000)
