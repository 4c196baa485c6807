# korcontrols_arithmetic(NAME [option...]): those parts of the library that only reckon, compiled for
# the machine that builds, as NAME. tests/native/include stands in for the platform's headers.
set(KORCONTROLS_ROOT ${CMAKE_CURRENT_LIST_DIR}/../..)

function(korcontrols_arithmetic name)
  set(src ${KORCONTROLS_ROOT}/src)
  add_library(${name} STATIC
    ${src}/graph/graph_disc.cpp
    ${src}/graph/graph_hit_test.cpp
    ${src}/graph/graph_numbers.cpp
    ${src}/graph/graph_palette.cpp
    ${src}/graph/graph_pie.cpp
    ${src}/graph/graph_points.cpp
    ${src}/graph/graph_record.cpp
    ${src}/graph/graph_scale.cpp
    ${src}/graph/graph_series.cpp
    ${src}/graph/graph_ticks.cpp
    ${src}/grid/grid_geometry.cpp
    ${src}/grid/grid_moves.cpp
    ${src}/header/header_hit_test.cpp
    ${src}/numbers/pixel_scale.cpp
    ${src}/platform/desktop/number_text.cpp
    ${src}/zoom/zoom.cpp
    ${KORCONTROLS_ROOT}/tests/native/no_drawing.cpp)
  target_include_directories(${name} PUBLIC
    ${KORCONTROLS_ROOT}/tests/native/include ${KORCONTROLS_ROOT}/include ${src})
  target_compile_options(${name} PRIVATE -O1 PUBLIC -DKORCONTROLS_ASSERTIONS ${ARGN})
endfunction()
