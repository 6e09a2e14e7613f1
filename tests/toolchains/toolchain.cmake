# Configures with TOOLCHAIN, a toolchain file for QNX: without an SDK in the environment, with a wrong
# one, and with a folder in WORK_DIR that has the form of one. Its q++ is a script that notes its
# arguments and calls COMPILER: it shows what CMake makes of the file, not that QNX compiles anything.

function(configure expected_exit)
    file(REMOVE_RECURSE ${WORK_DIR}/build)
    execute_process(
        COMMAND ${CMAKE_COMMAND} -G Ninja -S ${CMAKE_CURRENT_LIST_DIR}/project -B ${WORK_DIR}/build
            -DCMAKE_TOOLCHAIN_FILE=${TOOLCHAIN} ${ARGN}
        RESULT_VARIABLE exit_code OUTPUT_VARIABLE output ERROR_VARIABLE output)
    if(expected_exit STREQUAL "success" AND NOT exit_code EQUAL 0
            OR expected_exit STREQUAL "failure" AND exit_code EQUAL 0)
        message(FATAL_ERROR "Expected ${expected_exit}, exit code ${exit_code}:\n${output}")
    endif()
    string(REGEX REPLACE "[ \n]+" " " output "${output}")
    set(output "${output}" PARENT_SCOPE)
endfunction()

function(expect text)
    string(FIND "${output}" "${text}" at)
    if(at LESS 0)
        message(FATAL_ERROR "Expected \"${text}\" in:\n${output}")
    endif()
endfunction()

file(REMOVE_RECURSE ${WORK_DIR})
set(host ${WORK_DIR}/sdk/host)
set(target ${WORK_DIR}/sdk/target)

unset(ENV{QNX_HOST})
unset(ENV{QNX_TARGET})
configure(failure)
expect("QNX_HOST is not set in the environment. Source qnxsdp-env.sh of the QNX SDK first.")

set(ENV{QNX_HOST} ${host})
configure(failure)
expect("QNX_TARGET is not set in the environment.")

set(ENV{QNX_TARGET} ${target})
configure(failure)
expect("QNX_HOST is no folder: ${host}")

file(MAKE_DIRECTORY ${host}/usr/bin ${target}/usr/include)
configure(failure)
expect("There is no compiler ${host}/usr/bin/qcc.")

set(arguments ${WORK_DIR}/arguments)
foreach(name IN ITEMS qcc q++)
    # CMake knows QNX's compilers by the macro, and by what they say to a mere -V; it then hands them
    # arguments that only they know.
    file(WRITE ${host}/usr/bin/${name} "#!/bin/sh
echo \"$*\" >> '${arguments}'
[ \"$*\" = -V ] && exec echo 'targets available in this folder:'
for argument do
    shift
    case $argument in -V*|-lang-c++) ;; *) set -- \"$@\" \"$argument\" ;; esac
done
exec '${COMPILER}' -D__QNXNTO__ \"$@\"
")
    file(CHMOD ${host}/usr/bin/${name} PERMISSIONS OWNER_READ OWNER_WRITE OWNER_EXECUTE)
endforeach()
file(WRITE ${target}/usr/include/probe.h "")
file(WRITE ${WORK_DIR}/onhost/hostprobe.h "")

configure(failure -DHMI_QNX_QT_DIR=${WORK_DIR}/noqt)
expect("HMI_QNX_QT_DIR holds no Qt 5: ${WORK_DIR}/noqt/lib/cmake/Qt5Core is missing")

configure(success -DPROBE_HOST_DIR=${WORK_DIR}/onhost)
expect("Target: QNX 7 ${PROCESSOR}")
expect("Compiler: QCC ${host}/usr/bin/q++")
expect("Headers: ${target}/usr/include PROBE_HOST_INCLUDE_DIR-NOTFOUND ")

file(REMOVE ${arguments})
execute_process(COMMAND ${CMAKE_COMMAND} --build ${WORK_DIR}/build RESULT_VARIABLE exit_code
    OUTPUT_VARIABLE output ERROR_VARIABLE output)
if(NOT exit_code EQUAL 0)
    message(FATAL_ERROR "${output}")
endif()
file(READ ${arguments} output)
expect("-V${VARIANT} ")
