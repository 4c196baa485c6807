# Shared by the two desktop toolchains: Debian's mingw-w64 with POSIX threads, programs run by Wine.
set(CMAKE_SYSTEM_NAME Windows)
set(CMAKE_SYSTEM_PROCESSOR ${KOR_MACHINE})
set(CMAKE_C_COMPILER ${KOR_MACHINE}-w64-mingw32-gcc-posix)
set(CMAKE_CXX_COMPILER ${KOR_MACHINE}-w64-mingw32-g++-posix)
set(CMAKE_RC_COMPILER ${KOR_MACHINE}-w64-mingw32-windres)
set(CMAKE_AR ${KOR_MACHINE}-w64-mingw32-gcc-ar-posix)
set(CMAKE_RANLIB ${KOR_MACHINE}-w64-mingw32-gcc-ranlib-posix)
set(CMAKE_OBJDUMP ${KOR_MACHINE}-w64-mingw32-objdump)
set(CMAKE_FIND_ROOT_PATH /usr/${KOR_MACHINE}-w64-mingw32)
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_RC_FLAGS_INIT "--codepage=65001")
# No mingw run-time DLL beside a program.
set(CMAKE_EXE_LINKER_FLAGS_INIT "-static -static-libgcc -static-libstdc++")
set(CMAKE_SHARED_LINKER_FLAGS_INIT "-static-libgcc")
# Each Windows program of the build runs through this, test discovery included.
set(CMAKE_CROSSCOMPILING_EMULATOR "${CMAKE_CURRENT_LIST_DIR}/../../scripts/wine-run")
