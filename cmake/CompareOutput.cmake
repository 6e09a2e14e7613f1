# cmake -DEXPECTED=.. -DEXIT_CODE=.. -DSTREAM=.. [-DLINES=..] -DACTUAL=.. -P CompareOutput.cmake
#       -- <command>...
#
# Fails when the command's output on STREAM is not the text of EXPECTED, when its exit code is not
# EXIT_CODE, or when it succeeds and yet writes to stderr, unless that is what is compared. With the
# regular expression LINES, only such lines of STREAM count, and nothing else.

set(command "")
set(found_separator FALSE)
math(EXPR last "${CMAKE_ARGC} - 1")
foreach(index RANGE ${last})
    if(found_separator)
        list(APPEND command "${CMAKE_ARGV${index}}")
    elseif(CMAKE_ARGV${index} STREQUAL "--")
        set(found_separator TRUE)
    endif()
endforeach()

execute_process(COMMAND ${command}
    OUTPUT_VARIABLE stdout
    ERROR_VARIABLE stderr
    RESULT_VARIABLE exit_code)
file(READ ${EXPECTED} expected)
if(LINES)
    string(REGEX MATCHALL "[^\n]*\n" all "${${STREAM}}")
    list(FILTER all INCLUDE REGEX "${LINES}")
    list(JOIN all "" ${STREAM})
    set(stderr "")
endif()

if(NOT "${${STREAM}}" STREQUAL "${expected}")
    file(WRITE ${ACTUAL} "${${STREAM}}")
    find_program(DIFF diff)
    if(DIFF)
        execute_process(COMMAND ${DIFF} -u ${EXPECTED} ${ACTUAL})
    endif()
    message(FATAL_ERROR "${STREAM} is not as expected.\n"
        "Expected: ${EXPECTED}\nActual: ${ACTUAL}\nExit code: ${exit_code}\n${stderr}")
endif()
if(EXIT_CODE EQUAL 0 AND STREAM STREQUAL "stdout" AND NOT "${stderr}" STREQUAL "")
    message(FATAL_ERROR "Nothing was expected on stderr, found:\n${stderr}")
endif()
if(NOT "${exit_code}" STREQUAL "${EXIT_CODE}")
    message(FATAL_ERROR "Expected exit code ${EXIT_CODE}, found ${exit_code}\n${stderr}")
endif()
