# Toolchain: 64-bit Windows, cross-built by MinGW-w64 on Debian, its programs run by Wine.

set(CMAKE_SYSTEM_NAME Windows)
set(CMAKE_SYSTEM_PROCESSOR x86_64)
set(CMAKE_C_COMPILER x86_64-w64-mingw32-gcc-posix)
set(CMAKE_CXX_COMPILER x86_64-w64-mingw32-g++-posix)
set(CMAKE_RC_COMPILER x86_64-w64-mingw32-windres)
list(APPEND CMAKE_FIND_ROOT_PATH /usr/x86_64-w64-mingw32)
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE ONLY)
set(CMAKE_EXE_LINKER_FLAGS_INIT "-static")

# One Wine prefix for all builds of this source tree; it is large, and making it takes some seconds.
get_filename_component(TESSAL_WINE_PREFIX "${CMAKE_CURRENT_LIST_DIR}/../build/wine" ABSOLUTE)
set(CMAKE_CROSSCOMPILING_EMULATOR
    "env;WINEPREFIX=${TESSAL_WINE_PREFIX};WINEDEBUG=-all;WINEDLLOVERRIDES=mscoree,mshtml=;/usr/lib/wine/wine64")
