# Cross-compiles VantorBase for 64-bit Windows with Debian's Clang, using the
# MinGW-w64 headers and libraries (and the libstdc++ of its POSIX-threads GCC)
# and linking with LLD. Programs run under Wine, as with the GCC toolchain.
include(${CMAKE_CURRENT_LIST_DIR}/mingw-w64-common.cmake)

set(CMAKE_C_COMPILER clang)
set(CMAKE_CXX_COMPILER clang++)
set(CMAKE_C_COMPILER_TARGET ${VANTORBASE_MINGW_TRIPLE})
set(CMAKE_CXX_COMPILER_TARGET ${VANTORBASE_MINGW_TRIPLE})

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
