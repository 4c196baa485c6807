# Windows CE 3.0 on ARM: Debian's compiler for bare ARM, an assembler and a linker for Windows CE's
# object format, and the desktop's platform and language headers. docs/device.md says how they fit.
set(CMAKE_SYSTEM_NAME WindowsCE)
set(CMAKE_SYSTEM_VERSION 3.0)
set(CMAKE_SYSTEM_PROCESSOR arm)
list(APPEND CMAKE_MODULE_PATH ${CMAKE_CURRENT_LIST_DIR}/..)  # Platform/WindowsCE-GNU*.cmake
get_filename_component(KOR_WINCE ${CMAKE_CURRENT_LIST_DIR}/../wince ABSOLUTE)
get_filename_component(KOR_SCRIPTS ${CMAKE_CURRENT_LIST_DIR}/../../scripts ABSOLUTE)

# CMake's checks of the compiler must not need a run-time library.
set(CMAKE_TRY_COMPILE_TARGET_TYPE STATIC_LIBRARY)
set(CMAKE_TRY_COMPILE_PLATFORM_VARIABLES KOR_DEVICE_TOOLS)

if(NOT KOR_DEVICE_TOOLS)
  # Fast when everything is there: the packages are checked first, and the tools built once per machine.
  execute_process(COMMAND ${KOR_SCRIPTS}/setup device RESULT_VARIABLE _status)
  if(NOT _status EQUAL 0)
    message(FATAL_ERROR "scripts/setup device failed")
  endif()
  execute_process(COMMAND ${KOR_SCRIPTS}/device-tools
    OUTPUT_VARIABLE KOR_DEVICE_TOOLS OUTPUT_STRIP_TRAILING_WHITESPACE COMMAND_ERROR_IS_FATAL ANY)
endif()

set(CMAKE_C_COMPILER arm-none-eabi-gcc)
set(CMAKE_CXX_COMPILER arm-none-eabi-g++)
set(CMAKE_RC_COMPILER ${KOR_DEVICE_TOOLS}/windres)
foreach(_tool AR RANLIB LINKER OBJDUMP NM DLLTOOL)
  string(TOLOWER ${_tool} _program)
  string(REPLACE linker ld _program ${_program})
  set(CMAKE_${_tool} ${KOR_DEVICE_TOOLS}/${_program})
endforeach()

# The calling convention is Windows CE's: -mabi=apcs-gnu, 64-bit arguments in the next two words, a
# stack aligned to words. Characters are signed, wide ones have 16 bits, enumerations have 32. Stacks are
# small there and grow page by page, so a function takes half a page at most.
string(JOIN " " _machine
  -march=armv4 -marm -mno-thumb-interwork -mabi=apcs-gnu -mfloat-abi=soft
  -fshort-wchar -fsigned-char -fno-short-enums
  -fno-unwind-tables -fno-asynchronous-unwind-tables -fno-stack-protector -Wframe-larger-than=2048
  "\"-B${KOR_WINCE}/bin\"" "\"-Wa,--coff-assembler=${KOR_DEVICE_TOOLS}/as\"")

# Headers: the desktop's, with its calling-convention keywords empty, since there is one convention here.
# Versions are those of Windows CE 3.0's time, so that no structure has members that it does not know.
execute_process(COMMAND i686-w64-mingw32-g++-posix -print-file-name=include
  OUTPUT_VARIABLE _desktop OUTPUT_STRIP_TRAILING_WHITESPACE COMMAND_ERROR_IS_FATAL ANY)
execute_process(COMMAND arm-none-eabi-gcc -print-file-name=include
  OUTPUT_VARIABLE _compiler OUTPUT_STRIP_TRAILING_WHITESPACE COMMAND_ERROR_IS_FATAL ANY)
string(JOIN " " _definitions
  -D_WIN32 -D_WIN32_WCE=300 -D_ARM_ -DARM -D__MSVCRT__ -D__USE_MINGW_ANSI_STDIO=0
  -DWINVER=0x0400 -D_WIN32_WINNT=0x0400 -D_WIN32_IE=0x0400
  -D__cdecl= -D_cdecl= -D__stdcall= -D_stdcall= -D__fastcall= -D__thiscall=
  "\"-D__int64=long long\"" "\"-D__declspec(what)=\"")
string(JOIN " " _headers -nostdinc
  -isystem ${_desktop}/c++ -isystem ${_desktop}/c++/i686-w64-mingw32
  -isystem "\"${KOR_WINCE}/include\"" -isystem /usr/share/mingw-w64/include
  -isystem ${_compiler} -include "\"${KOR_WINCE}/include/device_types.h\"")

set(CMAKE_C_FLAGS_INIT "${_machine} ${_definitions} ${_headers}")
set(CMAKE_CXX_FLAGS_INIT "${_machine} -fno-exceptions -fno-rtti -fno-sized-deallocation ${_definitions} ${_headers}")
string(JOIN " " CMAKE_RC_FLAGS_INIT
  --codepage=65001 --preprocessor=arm-none-eabi-cpp
  --preprocessor-arg=-nostdinc --preprocessor-arg=-DRC_INVOKED --preprocessor-arg=-D_WIN32
  --preprocessor-arg=-D_ARM_ -I/usr/share/mingw-w64/include -I${_compiler})
