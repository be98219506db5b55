# Cross-compiles VantorBase for 64-bit Windows with Debian's Clang, using the
# MinGW-w64 headers and libraries (and the libstdc++ of its POSIX-threads GCC)
# and linking with LLD. Programs run under Wine, as with the GCC toolchain.
set(CMAKE_SYSTEM_NAME Windows)
set(CMAKE_SYSTEM_PROCESSOR x86_64)

set(VANTORBASE_MINGW_TRIPLE x86_64-w64-mingw32)
set(CMAKE_C_COMPILER clang)
set(CMAKE_CXX_COMPILER clang++)
set(CMAKE_C_COMPILER_TARGET ${VANTORBASE_MINGW_TRIPLE})
set(CMAKE_CXX_COMPILER_TARGET ${VANTORBASE_MINGW_TRIPLE})
set(CMAKE_RC_COMPILER ${VANTORBASE_MINGW_TRIPLE}-windres)

# Clang does not recognise Debian's "12-posix" GCC folder name by itself:
# point it at that libstdc++ explicitly.
file(GLOB _vantorbase_gcc_dirs LIST_DIRECTORIES true "/usr/lib/gcc/${VANTORBASE_MINGW_TRIPLE}/*-posix")
list(SORT _vantorbase_gcc_dirs COMPARE NATURAL ORDER DESCENDING)
list(GET _vantorbase_gcc_dirs 0 _vantorbase_gcc)
set(_vantorbase_cxx "${_vantorbase_gcc}/include/c++")
set(CMAKE_CXX_FLAGS_INIT
    "-isystem ${_vantorbase_cxx} -isystem ${_vantorbase_cxx}/${VANTORBASE_MINGW_TRIPLE} -isystem ${_vantorbase_cxx}/backward")
set(_vantorbase_link "-fuse-ld=lld -L${_vantorbase_gcc} -lpthread")
set(CMAKE_EXE_LINKER_FLAGS_INIT "${_vantorbase_link}")
set(CMAKE_SHARED_LINKER_FLAGS_INIT "${_vantorbase_link}")
set(CMAKE_MODULE_LINKER_FLAGS_INIT "${_vantorbase_link}")

set(CMAKE_FIND_ROOT_PATH /usr/${VANTORBASE_MINGW_TRIPLE})
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE BOTH)

get_filename_component(_vantorbase_root "${CMAKE_CURRENT_LIST_DIR}/.." ABSOLUTE)
set(CMAKE_CROSSCOMPILING_EMULATOR "${_vantorbase_root}/tools/wine-run" CACHE FILEPATH "Runs Windows programs under Wine")
set(VANTORBASE_GTEST_SOURCE_DIR /usr/src/googletest CACHE PATH "GoogleTest sources built with the project")
