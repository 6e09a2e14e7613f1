# Runs PROGRAM with ARGUMENTS and compares what it writes, to both outputs, with the file EXPECTED.
# EXIT_CODE is what it has to end with, 0 unless given. Debug output is off.

if(NOT DEFINED EXIT_CODE)
    set(EXIT_CODE 0)
endif()
set(ENV{QT_FORCE_STDERR_LOGGING} 1)
set(ENV{QT_LOGGING_RULES} "*.debug=false")
execute_process(COMMAND ${PROGRAM} ${ARGUMENTS}
    RESULT_VARIABLE result OUTPUT_VARIABLE output ERROR_VARIABLE output)
file(READ ${EXPECTED} expected)
if(NOT result STREQUAL EXIT_CODE)
    message(FATAL_ERROR "Ended with ${result} instead of ${EXIT_CODE}:\n${output}")
endif()
if(NOT output STREQUAL expected)
    message(FATAL_ERROR "Expected (${EXPECTED}):\n${expected}\nFound:\n${output}")
endif()
