# What the scripts beside this file share.

# Runs a command that has to succeed; sets output.
function(run)
    execute_process(COMMAND ${ARGN} RESULT_VARIABLE result OUTPUT_VARIABLE output
        ERROR_VARIABLE output)
    if(NOT result EQUAL 0)
        string(REPLACE ";" " " command "${ARGN}")
        message(FATAL_ERROR "${command}\n${output}")
    endif()
    set(output "${output}" PARENT_SCOPE)
endfunction()

# The output matches an expression.
function(expect text)
    if(NOT output MATCHES "${text}")
        message(FATAL_ERROR "Expected \"${text}\" in:\n${output}")
    endif()
endfunction()

set(configure ${CMAKE_COMMAND} -G Ninja -DCMAKE_BUILD_TYPE=Debug
    -DCMAKE_CXX_COMPILER=${CXX_COMPILER} -DCMAKE_CXX_COMPILER_LAUNCHER=${LAUNCHER})

# The strictest settings that an application may choose.
set(options "")
if(STRICT)
    set(options -Wall -Wextra -Wpedantic -Werror -fno-exceptions
        -DQT_NO_KEYWORDS -DQT_NO_CAST_FROM_ASCII)
endif()
