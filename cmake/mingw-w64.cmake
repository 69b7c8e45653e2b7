# Programs for 64-bit Windows, made on Debian with its package g++-mingw-w64-x86-64-posix (C++'s threads need the variant).
set(CMAKE_SYSTEM_NAME Windows)
set(CMAKE_SYSTEM_VERSION 10)
set(CMAKE_SYSTEM_PROCESSOR x86_64)

set(triple x86_64-w64-mingw32)
set(CMAKE_C_COMPILER ${triple}-gcc-posix)
set(CMAKE_CXX_COMPILER ${triple}-g++-posix)
set(CMAKE_RC_COMPILER ${triple}-windres)
# Windows 10 and later, as Qt 6 wants.
set(CMAKE_C_FLAGS_INIT -D_WIN32_WINNT=0x0A00)
set(CMAKE_CXX_FLAGS_INIT -D_WIN32_WINNT=0x0A00)

# Where the libraries are: a folder for each of them, from scripts/windows.sh. Nothing of the machine that builds is taken.
set(KAREPORT_WINDOWS_PREFIX "" CACHE STRING "Folders of the libraries for Windows")
list(APPEND CMAKE_TRY_COMPILE_PLATFORM_VARIABLES KAREPORT_WINDOWS_PREFIX)
set(CMAKE_FIND_ROOT_PATH ${KAREPORT_WINDOWS_PREFIX} /usr/${triple})
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE ONLY)
# Debian has zlib both ways: programs take the one that needs no DLL.
set(ZLIB_LIBRARY /usr/${triple}/lib/libz.a CACHE FILEPATH "")
