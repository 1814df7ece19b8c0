# SPDX-License-Identifier: Apache-2.0
# Toolchain: programs for Windows 10 and later, built with mingw-w64 on a host that isn't Windows.
# Where Wine is installed, what is built can be run, and so tested.
set(CMAKE_SYSTEM_NAME Windows)
set(CMAKE_SYSTEM_PROCESSOR x86_64)

set(target x86_64-w64-mingw32)
# Of the two builds of the compiler, the one whose C++ library has threads; tests start some.
find_program(QUARN_MINGW_CXX NAMES ${target}-g++-posix ${target}-g++ REQUIRED
  DOC "The compiler for Windows (package g++-mingw-w64-x86-64)")
set(CMAKE_CXX_COMPILER ${QUARN_MINGW_CXX})
string(REPLACE "g++" "gcc" CMAKE_C_COMPILER ${QUARN_MINGW_CXX}) # tests are built with a library that asks for one
set(CMAKE_RC_COMPILER ${target}-windres)
# The compiler's own libraries are on no machine but this one.
set(CMAKE_EXE_LINKER_FLAGS_INIT "-static")

set(CMAKE_FIND_ROOT_PATH /usr/${target})
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE ONLY)

find_program(QUARN_WINE NAMES wine wine64 DOC "Runs programs for Windows (package wine64)")
if(QUARN_WINE)
  set(CMAKE_CROSSCOMPILING_EMULATOR ${QUARN_WINE})
endif()
unset(target)
