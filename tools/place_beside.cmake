# korcontrols_place_beside(FOLDER TARGET): the target's file appears in the folder as well, without
# taking place on the disk; asking again changes nothing. The stamps of a folder are in its global property.
function(korcontrols_place_beside folder target)
  get_property(stamps GLOBAL PROPERTY KORCONTROLS_BESIDE_${folder})
  if(${folder}/${target}.stamp IN_LIST stamps)
    return()
  endif()
  set(name $<TARGET_FILE_NAME:${target}>)
  add_custom_command(OUTPUT ${folder}/${target}.stamp
    COMMAND ${CMAKE_COMMAND} -E create_hardlink $<TARGET_FILE:${target}> ${folder}/${name}
    COMMAND ${CMAKE_COMMAND} -E touch ${folder}/${target}.stamp
    DEPENDS ${target} $<TARGET_FILE:${target}>
    VERBATIM)
  set_property(GLOBAL APPEND PROPERTY KORCONTROLS_BESIDE_${folder} ${folder}/${target}.stamp)
endfunction()
