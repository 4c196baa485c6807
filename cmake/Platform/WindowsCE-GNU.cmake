# How CMake builds libraries for Windows CE with GNU tools: the compiler makes the objects, and the
# linker is called directly, since the compiler only knows another platform's.
include_guard()

set(CMAKE_STATIC_LIBRARY_PREFIX lib)
set(CMAKE_STATIC_LIBRARY_SUFFIX .a)
set(CMAKE_SHARED_LIBRARY_PREFIX lib)
set(CMAKE_SHARED_LIBRARY_SUFFIX .dll)
set(CMAKE_IMPORT_LIBRARY_PREFIX lib)
set(CMAKE_IMPORT_LIBRARY_SUFFIX .dll.a)
set(CMAKE_LIBRARY_PATH_FLAG -L)
set(CMAKE_LINK_LIBRARY_FLAG -l)
set(CMAKE_LINK_LIBRARY_SUFFIX "")
set(CMAKE_LINK_DEF_FILE_FLAG "")  # passing the file is enough

set(CMAKE_RC_OUTPUT_EXTENSION .obj)
set(CMAKE_RC_COMPILE_OBJECT
  "<CMAKE_RC_COMPILER> -O coff <DEFINES> <INCLUDES> <FLAGS> <SOURCE> <OBJECT>")

macro(windows_ce_gnu language)
  unset(CMAKE_${language}_LINKER_WRAPPER_FLAG)
  set(CMAKE_${language}_COMPILE_OPTIONS_PIC "")
  set(CMAKE_SHARED_LIBRARY_${language}_FLAGS "")
  # Sorted and without timestamps, so that the same objects give the same bytes.
  set(CMAKE_${language}_ARCHIVE_CREATE "<CMAKE_AR> qcD <TARGET> <OBJECTS>")
  set(CMAKE_${language}_ARCHIVE_APPEND "<CMAKE_AR> qD <TARGET> <OBJECTS>")
  set(CMAKE_${language}_ARCHIVE_FINISH "<CMAKE_RANLIB> -D <TARGET>")
  # Only the loader of later systems reads the two flags that are switched off.
  set(CMAKE_${language}_CREATE_SHARED_LIBRARY
    "<CMAKE_LINKER> -shared --subsystem wince:3.0 --major-os-version 3 --minor-os-version 0 --disable-dynamicbase --disable-nxcompat --image-base 0x10000000 <LINK_FLAGS> -o <TARGET> <OBJECTS> <LINK_LIBRARIES>")
endmacro()
