# Configures, builds and runs one consumer project against this build of
# VantorBase. Arguments (-D): MODE (installed or subdirectory), SOURCE_DIR,
# BUILD_DIR (this build), WORK_DIR, GENERATOR, TOOLCHAIN_FILE, BUILD_TYPE,
# EMULATOR (may be empty).
set(_consumer ${SOURCE_DIR}/tests/consumer/${MODE})
file(REMOVE_RECURSE ${WORK_DIR})
set(_args -G "${GENERATOR}" -DCMAKE_BUILD_TYPE=${BUILD_TYPE})
if(TOOLCHAIN_FILE)
    list(APPEND _args -DCMAKE_TOOLCHAIN_FILE=${TOOLCHAIN_FILE})
endif()

function(run)
    execute_process(COMMAND ${ARGN} RESULT_VARIABLE _rc OUTPUT_VARIABLE _out ERROR_VARIABLE _out)
    if(NOT _rc EQUAL 0)
        message(FATAL_ERROR "failed (${_rc}): ${ARGN}\n${_out}")
    endif()
    set(_last_output "${_out}" PARENT_SCOPE)
endfunction()

if(MODE STREQUAL "installed")
    run(${CMAKE_COMMAND} --install ${BUILD_DIR} --prefix ${WORK_DIR}/prefix --config ${BUILD_TYPE})
    foreach(path include/vantorbase/vantorbase.h bin/VantorBase.dll lib/cmake/VantorBase/VantorBaseConfig.cmake
                 lib/cmake/VantorBase/VantorBaseConfigVersion.cmake)
        if(NOT EXISTS ${WORK_DIR}/prefix/${path})
            message(FATAL_ERROR "the installed package lacks ${path}")
        endif()
    endforeach()
    list(APPEND _args -DCMAKE_PREFIX_PATH=${WORK_DIR}/prefix)
else()
    list(APPEND _args -DVANTORBASE_SOURCE_DIR=${SOURCE_DIR})
endif()

run(${CMAKE_COMMAND} -S ${_consumer} -B ${WORK_DIR}/build ${_args})
run(${CMAKE_COMMAND} --build ${WORK_DIR}/build --config ${BUILD_TYPE} -j2)
file(GLOB_RECURSE _programs ${WORK_DIR}/build/consumer.exe)
list(GET _programs 0 _program)
run(${EMULATOR} ${_program})
if(NOT _last_output MATCHES "consumer works")
    message(FATAL_ERROR "unexpected consumer output:\n${_last_output}")
endif()
message(STATUS "${_last_output}")
