# korcontrols_arithmetic(NAME [option...]): those parts of the library that only reckon, compiled for
# the machine that builds, as two libraries: NAME_rules needs no header of the platform, and NAME are
# the records' own functions, for which tests/native/include stands in for those headers.
set(KORCONTROLS_ROOT ${CMAKE_CURRENT_LIST_DIR}/../..)

function(korcontrols_arithmetic name)
  set(src ${KORCONTROLS_ROOT}/src)
  add_library(${name}_rules STATIC
    ${src}/graph/scale/axis.cpp
    ${src}/graph/scale/number_format.cpp
    ${src}/graph/scale/ticks.cpp
    ${src}/graph/shapes/bar_layout.cpp
    ${src}/graph/shapes/disc.cpp
    ${src}/graph/shapes/pie_layout.cpp
    ${src}/graph/shapes/points.cpp
    ${src}/grid/geometry.cpp
    ${src}/grid/moves.cpp
    ${src}/header/hit_test.cpp
    ${src}/numbers/pixel_scale.cpp
    ${src}/zoom/zoom.cpp
    ${KORCONTROLS_ROOT}/tests/native/number_text.cpp)
  target_include_directories(${name}_rules PUBLIC ${src})
  add_library(${name} STATIC
    ${src}/graph/data/palette.cpp
    ${src}/graph/data/series.cpp
    ${src}/graph/hit_test.cpp
    ${src}/graph/data/record.cpp
    ${src}/graph/data/axes.cpp)
  target_include_directories(${name} PUBLIC
    ${KORCONTROLS_ROOT}/tests/native/include ${KORCONTROLS_ROOT}/include)
  target_link_libraries(${name} PUBLIC ${name}_rules)
  foreach(library ${name} ${name}_rules)
    target_compile_options(${library} PRIVATE -O1 PUBLIC ${ARGN})
    target_compile_definitions(${library} PUBLIC KORCONTROLS_ASSERTIONS)
  endforeach()
endfunction()
