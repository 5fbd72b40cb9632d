# Cross build for 64-bit Windows with MinGW-w64 (Debian: g++-mingw-w64-x86-64-posix,
# binutils-mingw-w64-x86-64). Test executables run under Wine (Debian: wine64),
# so ctest runs the Windows build's tests unchanged on a Linux host.
set(CMAKE_SYSTEM_NAME Windows)
set(CMAKE_SYSTEM_PROCESSOR x86_64)

set(REDAVUDEVA_MINGW_TRIPLE x86_64-w64-mingw32)

# The posix thread model: std::thread and std::mutex exist (GoogleTest uses them).
find_program(REDAVUDEVA_MINGW_CXX NAMES ${REDAVUDEVA_MINGW_TRIPLE}-g++-posix ${REDAVUDEVA_MINGW_TRIPLE}-g++
             REQUIRED)
find_program(REDAVUDEVA_MINGW_CC NAMES ${REDAVUDEVA_MINGW_TRIPLE}-gcc-posix ${REDAVUDEVA_MINGW_TRIPLE}-gcc
             REQUIRED)
set(CMAKE_CXX_COMPILER ${REDAVUDEVA_MINGW_CXX})
set(CMAKE_C_COMPILER ${REDAVUDEVA_MINGW_CC})
set(CMAKE_RC_COMPILER ${REDAVUDEVA_MINGW_TRIPLE}-windres)

set(CMAKE_FIND_ROOT_PATH /usr/${REDAVUDEVA_MINGW_TRIPLE})
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE ONLY)

# pkg-config must not offer the build machine's libraries for the target.
set(ENV{PKG_CONFIG_LIBDIR} ${CMAKE_FIND_ROOT_PATH}/lib/pkgconfig)
set(ENV{PKG_CONFIG_PATH} "")

# The 64-bit Wine loader itself: the `wine` wrapper script looks for a 32-bit
# Wine first and warns on every start when there is none.
find_program(REDAVUDEVA_WINE NAMES wine64 wine PATHS /usr/lib/wine NO_DEFAULT_PATH)
if(NOT REDAVUDEVA_WINE)
    find_program(REDAVUDEVA_WINE NAMES wine64 wine)
endif()
# Through a small script that tries a program once more when Wine fails to
# start it at all.
if(REDAVUDEVA_WINE)
    set(CMAKE_CROSSCOMPILING_EMULATOR /bin/sh ${CMAKE_CURRENT_LIST_DIR}/wine_run.sh ${REDAVUDEVA_WINE})
endif()

# objdump of the cross binutils, for the export-table tests.
find_program(REDAVUDEVA_MINGW_OBJDUMP NAMES ${REDAVUDEVA_MINGW_TRIPLE}-objdump)
