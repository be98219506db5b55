# Settings shared by the MinGW-w64 toolchain files: the target system, where
# the Windows libraries live, the Wine launcher for the produced programs, and
# the GoogleTest sources built with the project.
set(CMAKE_SYSTEM_NAME Windows)
set(CMAKE_SYSTEM_PROCESSOR x86_64)
set(VANTORBASE_MINGW_TRIPLE x86_64-w64-mingw32)
set(CMAKE_RC_COMPILER ${VANTORBASE_MINGW_TRIPLE}-windres)

set(CMAKE_FIND_ROOT_PATH /usr/${VANTORBASE_MINGW_TRIPLE})
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE BOTH)

get_filename_component(_vantorbase_root "${CMAKE_CURRENT_LIST_DIR}/.." ABSOLUTE)
set(CMAKE_CROSSCOMPILING_EMULATOR "${_vantorbase_root}/tools/wine-run" CACHE FILEPATH
    "Runs Windows programs under Wine")
set(VANTORBASE_GTEST_SOURCE_DIR /usr/src/googletest CACHE PATH
    "GoogleTest sources built with the project")
