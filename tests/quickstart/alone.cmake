# cmake -DBUILD_DIR=.. -DEXAMPLE_DIR=.. -DPROGRAM=.. -DWORK_DIR=.. -DCXX_COMPILER=.. -P alone.cmake
#
# Installs BUILD_DIR below WORK_DIR, which is made anew, and builds one program of the example against
# that.

cmake_minimum_required(VERSION 3.22)

function(run)
    execute_process(COMMAND ${ARGN} RESULT_VARIABLE result OUTPUT_VARIABLE output
        ERROR_VARIABLE output)
    if(NOT result EQUAL 0)
        string(REPLACE ";" " " command "${ARGN}")
        message(FATAL_ERROR "${command}\n${output}")
    endif()
endfunction()

file(REMOVE_RECURSE ${WORK_DIR})
run(${CMAKE_COMMAND} --install ${BUILD_DIR} --prefix ${WORK_DIR}/prefix)
run(${CMAKE_COMMAND} -G Ninja -S ${EXAMPLE_DIR} -B ${WORK_DIR}/build
    -DCMAKE_BUILD_TYPE=Debug -DCMAKE_CXX_COMPILER=${CXX_COMPILER}
    -DCMAKE_PREFIX_PATH=${WORK_DIR}/prefix)
run(${CMAKE_COMMAND} --build ${WORK_DIR}/build --target ${PROGRAM})
if(NOT EXISTS ${WORK_DIR}/build/${PROGRAM})
    message(FATAL_ERROR "There is no program")
endif()
