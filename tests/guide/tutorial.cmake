set(tutorial_dir ${PROJECT_SOURCE_DIR}/examples/tutorial)
foreach(number IN ITEMS 01 02 03 04 05 06 07 08 09 10)
    hmi_add_guide_output(tutorial-step${number} ${tutorial_dir}/step${number}/output.expected
        tutorial-step${number})
endforeach()
# Its first and last lines tell versions and times.
hmi_add_output_test(tutorial-step10-test COMMAND tutorial-step10-test
    EXPECTED ${tutorial_dir}/step10/test.expected LINES "^(PASS|FAIL|SKIP|XFAIL|XPASS) "
    LABELS guide)
set_tests_properties(tutorial-step10-test PROPERTIES LABELS guide)

if(TARGET hmi-rules)
    hmi_add_output_test(tutorial-step07-lint COMMAND hmi-rules lint draft.json
        EXPECTED ${tutorial_dir}/step07/lint.expected EXIT_CODE 1
        DIRECTORY ${tutorial_dir}/step07 LABELS guide)
    hmi_add_output_test(tutorial-step07-explain
        COMMAND hmi-rules explain interruptions.json phone/call audio/volume
        EXPECTED ${tutorial_dir}/step07/explain.expected DIRECTORY ${tutorial_dir} LABELS guide)
    add_test(NAME tutorial-rules COMMAND hmi-rules lint --fail-on note interruptions.json
        WORKING_DIRECTORY ${tutorial_dir})
    set_tests_properties(tutorial-rules PROPERTIES LABELS guide TIMEOUT 30)
endif()

hmi_add_guide_page(tutorial ${tutorial_dir})

# It can be copied out of here, and built with what is installed: the last step, which needs the most.
if(HMISTATEMACHINE_TEST_PACKAGE)
    add_test(NAME tutorial-alone COMMAND ${CMAKE_COMMAND}
        -D BUILD_DIR=${PROJECT_BINARY_DIR}
        -D EXAMPLE_DIR=${tutorial_dir}
        -D PROGRAM=tutorial-step10-test
        -D WORK_DIR=${CMAKE_CURRENT_BINARY_DIR}/tutorial-alone
        -D CXX_COMPILER=${CMAKE_CXX_COMPILER}
        -P ${PROJECT_SOURCE_DIR}/tests/quickstart/alone.cmake)
    set_tests_properties(tutorial-alone PROPERTIES LABELS "guide;package" TIMEOUT 900)
endif()
