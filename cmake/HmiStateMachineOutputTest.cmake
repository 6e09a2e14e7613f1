# hmi_add_output_test(<name> COMMAND <command> [<argument>...] EXPECTED <file>
#                     [EXIT_CODE <code>] [STREAM stdout|stderr] [DIRECTORY <dir>] [LABELS <label>...]
#                     [LINES <regular expression>] [LAUNCHER <command> [<argument>...]])
#
# A test that runs a command and compares all that it writes, and its exit code, with a file. What
# it wrote is left beside the build as <name>.actual when it differs. With LINES only such lines are
# compared, and stderr is left alone. A launcher is what the whole test is run through, xvfb-run say;
# what that writes itself is not compared.
function(hmi_add_output_test name)
    cmake_parse_arguments(PARSE_ARGV 1 arg "" "EXPECTED;EXIT_CODE;STREAM;DIRECTORY;LINES"
        "COMMAND;LABELS;LAUNCHER")
    list(POP_FRONT arg_COMMAND target)
    if(NOT arg_EXIT_CODE)
        set(arg_EXIT_CODE 0)
    endif()
    if(NOT arg_STREAM)
        set(arg_STREAM stdout)
    endif()
    if(NOT arg_DIRECTORY)
        set(arg_DIRECTORY ${CMAKE_CURRENT_SOURCE_DIR})
    endif()
    add_test(NAME ${name}
        COMMAND ${arg_LAUNCHER} ${CMAKE_COMMAND}
            -DEXPECTED=${arg_EXPECTED}
            -DEXIT_CODE=${arg_EXIT_CODE}
            -DSTREAM=${arg_STREAM}
            "-DLINES=${arg_LINES}"
            -DACTUAL=${CMAKE_CURRENT_BINARY_DIR}/${name}.actual
            -P ${PROJECT_SOURCE_DIR}/cmake/CompareOutput.cmake
            -- $<TARGET_FILE:${target}> ${arg_COMMAND}
        WORKING_DIRECTORY ${arg_DIRECTORY})
    set_tests_properties(${name} PROPERTIES LABELS "${arg_LABELS}" TIMEOUT 30)
endfunction()
