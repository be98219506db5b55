# Cross-compiles VantorBase for 64-bit Windows with Debian's MinGW-w64 GCC
# (POSIX threads flavour) and runs the produced programs under Wine.
include(${CMAKE_CURRENT_LIST_DIR}/mingw-w64-common.cmake)

set(CMAKE_C_COMPILER   ${VANTORBASE_MINGW_TRIPLE}-gcc-posix)
set(CMAKE_CXX_COMPILER ${VANTORBASE_MINGW_TRIPLE}-g++-posix)
