# korcontrols_arithmetic(NAME [option...]): those parts of the library that only reckon, compiled for
# the machine that builds, as NAME. tests/native/include stands in for the platform's headers.
set(KORCONTROLS_ROOT ${CMAKE_CURRENT_LIST_DIR}/../..)

function(korcontrols_arithmetic name)
  set(src ${KORCONTROLS_ROOT}/src)
  add_library(${name} STATIC
    ${src}/graph/shapes/disc.cpp
    ${src}/graph/hit_test.cpp
    ${src}/graph/scale/number_format.cpp
    ${src}/graph/data/palette.cpp
    ${src}/graph/drawing/pie.cpp
    ${src}/graph/shapes/points.cpp
    ${src}/graph/record.cpp
    ${src}/graph/scale/scale.cpp
    ${src}/graph/data/series.cpp
    ${src}/graph/scale/ticks.cpp
    ${src}/grid/geometry.cpp
    ${src}/grid/moves.cpp
    ${src}/header/hit_test.cpp
    ${src}/numbers/pixel_scale.cpp
    ${src}/platform/desktop/number_text.cpp
    ${src}/zoom/zoom.cpp
    ${KORCONTROLS_ROOT}/tests/native/no_drawing.cpp)
  target_include_directories(${name} PUBLIC
    ${KORCONTROLS_ROOT}/tests/native/include ${KORCONTROLS_ROOT}/include ${src})
  target_compile_options(${name} PRIVATE -O1 PUBLIC -DKORCONTROLS_ASSERTIONS ${ARGN})
endfunction()
